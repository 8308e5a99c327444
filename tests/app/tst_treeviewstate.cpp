// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/treeviewstate.h"
#include "tests/support/text.h"

#include <QScrollBar>
#include <QTest>
#include <QTreeView>

#include <algorithm>
#include <memory>
#include <vector>

namespace {

/// A tree whose nodes are changed within a reset; an index's internal pointer is its node.
class NodeModel final : public QAbstractItemModel
{
public:
    struct Node
    {
        QString name;
        Node *parent{};
        std::vector<std::unique_ptr<Node>> children{};

        Node &add(const QString &childName)
        {
            children.push_back(std::make_unique<Node>(Node{childName, this}));
            return *children.back();
        }
    };

    Node &top() { return m_top; }

    template<typename Change>
    void reset(const Change &change)
    {
        beginResetModel();
        change();
        endResetModel();
    }

    std::unique_ptr<Node> removeFirst()
    {
        beginRemoveRows({}, 0, 0);
        std::unique_ptr<Node> removed{std::move(m_top.children.front())};
        m_top.children.erase(m_top.children.begin());
        endRemoveRows();
        return removed;
    }

    QModelIndex index(int row, int column, const QModelIndex &parent = {}) const override
    {
        return hasIndex(row, column, parent)
                   ? createIndex(row, column, nodeOf(parent).children.at(static_cast<std::size_t>(row)).get())
                   : QModelIndex{};
    }
    QModelIndex parent(const QModelIndex &index) const override
    {
        Node *parent{nodeOf(index).parent};
        if (!parent || parent == &m_top)
            return {};
        int row{0};
        while (parent->parent->children.at(static_cast<std::size_t>(row)).get() != parent)
            ++row;
        return createIndex(row, 0, parent);
    }
    int rowCount(const QModelIndex &parent = {}) const override
    {
        return static_cast<int>(nodeOf(parent).children.size());
    }
    int columnCount(const QModelIndex & /*parent*/ = {}) const override { return 1; }
    QVariant data(const QModelIndex &index, int role) const override
    {
        return role == Qt::DisplayRole ? nodeOf(index).name : QVariant{};
    }

    Qt::ItemFlags flags(const QModelIndex &index) const override
    {
        const bool isMarked{m_marksLeaves && !hasChildren(index)};
        return QAbstractItemModel::flags(index) | (isMarked ? Qt::ItemNeverHasChildren : Qt::NoItemFlags);
    }
    void markLeaves(bool isMarked) { m_marksLeaves = isMarked; }

private:
    const Node &nodeOf(const QModelIndex &index) const
    {
        const auto *node = static_cast<const Node *>(index.internalPointer());
        return node ? *node : m_top;
    }

    mutable Node m_top{text("top")};
    bool m_marksLeaves{};
};

} // namespace

class TreeViewStateTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void everyBranchOpens();
    void noLeafIsMarkedAsOpen();
    void everyBranchOpensAgain();
    void openBranchesStayOverAReset();
    void openBranchWithinAClosedOneStays();
    void manyClosedBranchesStayOverAReset();
    void branchThatWasRemovedIsForgotten();
    void scrollPositionStaysOverAReset();
    void currentRowIsNotKept();
    void emptyModelIsNothing();

private:
    QModelIndex find(const QString &name, const QModelIndex &parent = {}) const;
    QStringList open() const;

    // Destroyed from the bottom up.
    std::unique_ptr<NodeModel> m_model;
    std::unique_ptr<QTreeView> m_tree;
    TreeViewState *m_viewState{};
};

// a { b { c d } e { } f }, g { h }, and many leaves
void TreeViewStateTest::init()
{
    m_tree.reset();
    m_model = std::make_unique<NodeModel>();
    NodeModel::Node &a{m_model->top().add(text("a"))};
    NodeModel::Node &b{a.add(text("b"))};
    b.add(text("c"));
    b.add(text("d")).add(text("i"));
    a.add(text("e"));
    m_model->top().add(text("g")).add(text("h"));
    for (int i{0}; i < 200; ++i)
        m_model->top().add(QString::number(i));

    m_tree = std::make_unique<QTreeView>();
    m_tree->setModel(m_model.get());
    m_viewState = new TreeViewState{m_tree.get(), [this](bool isMarked) { m_model->markLeaves(isMarked); }};
    m_tree->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_tree.get()));
}

QModelIndex TreeViewStateTest::find(const QString &name, const QModelIndex &parent) const
{
    for (int row{0}; row < m_model->rowCount(parent); ++row) {
        const QModelIndex index{m_model->index(row, 0, parent)};
        if (index.data().toString() == name)
            return index;
        if (const QModelIndex found{find(name, index)}; found.isValid())
            return found;
    }
    return {};
}

QStringList TreeViewStateTest::open() const
{
    QStringList names;
    for (const char *name : {"a", "b", "c", "d", "e", "g", "h", "i", "new", "7"}) {
        if (const QModelIndex index{find(text(name))}; index.isValid() && m_tree->isExpanded(index))
            names.append(text(name));
    }
    return names;
}

void TreeViewStateTest::everyBranchOpens()
{
    m_viewState->expandAll();
    QVERIFY(!m_tree->visualRect(find(text("i"))).isEmpty());
    QVERIFY(!m_tree->visualRect(find(text("h"))).isEmpty());
    QCOMPARE(m_tree->indexBelow(find(text("i"))), find(text("e")));
}

void TreeViewStateTest::noLeafIsMarkedAsOpen()
{
    m_viewState->expandAll();
    QCOMPARE(open(), text("a b d g").split(QLatin1Char{' '}));
}

void TreeViewStateTest::everyBranchOpensAgain()
{
    m_viewState->expandAll();
    m_tree->collapse(find(text("b")));
    m_tree->collapse(find(text("g")));
    m_viewState->expandAll();
    QCOMPARE(open(), text("a b d g").split(QLatin1Char{' '}));
    QVERIFY(!m_tree->visualRect(find(text("i"))).isEmpty());
}

void TreeViewStateTest::openBranchesStayOverAReset()
{
    m_tree->expand(find(text("a")));
    m_tree->expand(find(text("b")));
    m_model->reset([this] {
        auto &nodes = m_model->top().children;
        nodes.erase(nodes.begin() + 1); // g
        m_model->top().add(text("new")).add(text("newer"));
        std::rotate(nodes.begin(), nodes.begin() + 1, nodes.end()); // a comes last
    });
    QCOMPARE(open(), text("a b").split(QLatin1Char{' '}));
    m_tree->scrollTo(find(text("c")));
    QVERIFY(!m_tree->visualRect(find(text("c"))).isEmpty());
    QVERIFY(m_tree->visualRect(find(text("i"))).isEmpty());

    m_model->reset([] {});
    QCOMPARE(open(), text("a b").split(QLatin1Char{' '}));
}

void TreeViewStateTest::openBranchWithinAClosedOneStays()
{
    m_viewState->expandAll();
    m_tree->collapse(find(text("a")));
    m_model->reset([] {});
    QCOMPARE(open(), text("b d g").split(QLatin1Char{' '}));
    m_tree->expand(find(text("a")));
    QVERIFY(!m_tree->visualRect(find(text("i"))).isEmpty());
}

void TreeViewStateTest::manyClosedBranchesStayOverAReset()
{
    m_model->reset([this] {
        for (int i{0}; i < 50; ++i)
            m_model->top().add(text("many")).add(text("leaf"));
    });
    m_tree->expand(find(text("a")));
    m_tree->expand(find(text("7")));
    m_model->reset([] {});
    QCOMPARE(open(), text("a").split(QLatin1Char{' '}));
    QVERIFY(!m_tree->isExpanded(find(text("many"))));
    QVERIFY(!m_tree->visualRect(find(text("e"))).isEmpty());
}

void TreeViewStateTest::branchThatWasRemovedIsForgotten()
{
    m_viewState->expandAll();
    std::unique_ptr<NodeModel::Node> removed{m_model->removeFirst()};
    m_model->reset([&] { m_model->top().children.push_back(std::move(removed)); });
    QCOMPARE(open(), text("g").split(QLatin1Char{' '}));
}

void TreeViewStateTest::scrollPositionStaysOverAReset()
{
    m_viewState->expandAll();
    QScrollBar *bar{m_tree->verticalScrollBar()};
    QVERIFY(bar->maximum() > 60);
    bar->setValue(50);
    const QModelIndex first{m_tree->indexAt({1, 1})};
    const void *node{first.internalPointer()};
    m_model->reset([this] { m_model->top().add(text("new")); });
    QCOMPARE(bar->value(), 50);
    QCOMPARE(m_tree->indexAt({1, 1}).internalPointer(), node);
}

// Which row is current after a reset is up to the command.
void TreeViewStateTest::currentRowIsNotKept()
{
    m_tree->setCurrentIndex(find(text("g")));
    m_model->reset([] {});
    QVERIFY(!m_tree->currentIndex().isValid());
}

void TreeViewStateTest::emptyModelIsNothing()
{
    m_viewState->expandAll();
    m_model->reset([this] { m_model->top().children.clear(); });
    m_viewState->expandAll();
    QCOMPARE(open(), QStringList{});
    m_model->reset([this] { m_model->top().add(text("a")).add(text("h")); });
    QCOMPARE(open(), QStringList{});
}

QTEST_MAIN(TreeViewStateTest)
#include "tst_treeviewstate.moc"
