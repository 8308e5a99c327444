// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/app/topologywindow.h"

#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "dialogs/ipinputdialog.h"
#include "tests/support/dialogdriver.h"

#include <QAction>
#include <QApplication>
#include <QCheckBox>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMenu>
#include <QPushButton>
#include <QSpinBox>
#include <QTableView>
#include <QTest>
#include <QTextEdit>
#include <QTreeView>
#include <QWindow>

#include <algorithm>
#include <optional>

namespace {

using Visit = std::function<void(const QModelIndex &index)>;

void forEachIndex(const QAbstractItemModel &model, const QModelIndex &parent, const Visit &visit)
{
    for (int row{0}; row < model.rowCount(parent); ++row) {
        const QModelIndex index{model.index(row, 0, parent)};
        visit(index);
        forEachIndex(model, index, visit);
    }
}

QString wordsOf(const DhcpdConfigModel &model, const QModelIndex &index)
{
    const DhcpdConfigStatement &statement{*model.statementFor(index)};
    return statement.isRoot() ? QString{} : statement.joinedWords();
}

/// Every statement of a configuration in the program's own layout, behind the blocks around it.
QStringList placedLines(const QByteArray &content)
{
    QStringList placed;
    QStringList blocks;
    for (const QByteArray &bytes : content.split('\n')) {
        QString line{QString::fromUtf8(bytes).trimmed()};
        if (line == QLatin1String{"}"}) {
            blocks.removeLast();
            continue;
        }
        const bool opens{line.endsWith(QLatin1String{" {"})};
        if (opens)
            line.chop(2);
        if (!line.isEmpty())
            placed.append((blocks + QStringList{line}).join(QStringLiteral(" > ")));
        if (opens)
            blocks.append(line);
    }
    return placed;
}

/// The rows of a tree, each as "label: value", or as its label where it has no value.
QStringList shownRows(const QAbstractItemModel &model)
{
    QStringList rows;
    forEachIndex(model, {}, [&](const QModelIndex &index) {
        const QString value{index.siblingAtColumn(1).data().toString().trimmed()};
        rows.append(index.data().toString() + (value.isEmpty() ? QString{} : QStringLiteral(": ") + value));
    });
    return rows;
}

/// The lines that are only in `before`, behind a "-", and those that are only in `after`, behind a "+".
QStringList differences(const QStringList &before, const QStringList &after)
{
    QStringList added{after};
    QStringList changes;
    for (const QString &line : before) {
        if (!added.removeOne(line))
            changes.append(QLatin1Char{'-'} + line);
    }
    for (const QString &line : qAsConst(added))
        changes.append(QLatin1Char{'+'} + line);
    return changes;
}

QAction *entryOf(const QMenu &menu, const QString &text)
{
    const QList<QAction *> actions{menu.actions()};
    const auto found =
        std::find_if(actions.cbegin(), actions.cend(), [&](const QAction *action) { return action->text() == text; });
    return found == actions.cend() ? nullptr : *found;
}

QStringList itemsOf(const QListWidget &list)
{
    QStringList items;
    for (int row{0}; row < list.count(); ++row)
        items.append(list.item(row)->text());
    return items;
}

QStringList cellsOf(const QTableView &table)
{
    QStringList cells;
    for (int row{0}; row < table.model()->rowCount(); ++row) {
        for (int column{0}; column < table.model()->columnCount(); ++column)
            cells.append(table.model()->index(row, column).data().toString());
    }
    return cells;
}

QString stateOf(const QCheckBox &box)
{
    return (box.isChecked() ? QStringLiteral("[x]") : QStringLiteral("[ ]")) +
           (box.isEnabled() ? QString{} : QStringLiteral("*")) + QLatin1Char{' '} + box.text();
}

/// The text of a field or caption; none for a widget that only holds others.
std::optional<QString> textOf(const QWidget *widget)
{
    const QString comma{QStringLiteral(", ")};
    if (const auto *label = qobject_cast<const QLabel *>(widget))
        return label->text();
    if (const auto *line = qobject_cast<const QLineEdit *>(widget))
        return line->text();
    if (const auto *text = qobject_cast<const QTextEdit *>(widget))
        return text->toPlainText();
    if (const auto *number = qobject_cast<const QSpinBox *>(widget))
        return number->text();
    if (const auto *list = qobject_cast<const QListWidget *>(widget))
        return itemsOf(*list).join(comma);
    if (const auto *table = qobject_cast<const QTableView *>(widget))
        return cellsOf(*table).join(comma);
    if (const auto *box = qobject_cast<const QCheckBox *>(widget))
        return stateOf(*box);
    return {};
}

void appendShown(const QWidget &parent, QStringList &texts)
{
    for (QObject *child : parent.children()) {
        const auto *widget = qobject_cast<const QWidget *>(child);
        if (!widget || widget->isHidden() || qobject_cast<const QDialogButtonBox *>(widget))
            continue;
        if (const std::optional<QString> text{textOf(widget)}) {
            texts.append(*text);
            continue;
        }
        if (const auto *group = qobject_cast<const QGroupBox *>(widget))
            texts.append(group->title());
        appendShown(*widget, texts);
    }
}

void expectInput(ModalBoxes &boxes, const Input &input, const std::function<void(QDialog *dialog)> &close)
{
    boxes.expectDialog<QDialog>([&boxes, input, close](QDialog *dialog) {
        QCOMPARE(dialog->windowTitle(), input.title);
        QCOMPARE(shownIn(*dialog), input.shown);
        if (input.fill)
            input.fill(boxes, dialog);
        close(dialog);
    });
}

} // namespace

TopologyWindow::TopologyWindow(const QByteArray &configuration)
{
    m_machine.programs().install(QStringLiteral("dpkg-query"), "echo installed 1:9.18.28-1\n");
    writeTestFile(paths::configuration(), configuration);
    m_window = m_machine.openWindow();
    m_opened = content();
    m_shownAtFirst = shownRows(model());
    QObject::connect(&model(), &DhcpdConfigModel::dataChanged, &window(), [this] { ++m_notices; });
    QObject::connect(&model(), &DhcpdConfigModel::modelReset, &window(), [this] { ++m_resets; });
}

TopologyWindow::~TopologyWindow() = default;

QTreeView &TopologyWindow::tree() const { return *driver::find<QTreeView>(window(), QStringLiteral("topologyTree")); }

DhcpdConfigModel &TopologyWindow::model() const { return static_cast<DhcpdConfigModel &>(*tree().model()); }

QAction &TopologyWindow::action(const char *name) const
{
    auto *action = window().findChild<QAction *>(QLatin1String{name});
    if (!action)
        qFatal("no action \"%s\"", name);
    return *action;
}

QModelIndex TopologyWindow::find(const QString &statement, int column) const
{
    const QModelIndex network{model().index(0, column)};
    if (statement.isEmpty())
        return network;
    QModelIndex found;
    forEachIndex(model(), network.siblingAtColumn(0), [&](const QModelIndex &index) {
        if (!found.isValid() && wordsOf(model(), index).startsWith(statement))
            found = index.siblingAtColumn(column);
    });
    if (!found.isValid())
        qFatal("no statement \"%s\"", qPrintable(statement));
    return found;
}

QString TopologyWindow::current() const { return wordsOf(model(), tree().currentIndex()); }

QStringList TopologyWindow::openBranches() const
{
    QStringList open;
    forEachIndex(model(), {}, [&](const QModelIndex &index) {
        if (model().hasChildren(index) && tree().isExpanded(index))
            open.append(wordsOf(model(), index));
    });
    return open;
}

bool TopologyWindow::isInView(const QModelIndex &index) const
{
    const QRect rectangle{tree().visualRect(index)};
    return !rectangle.isEmpty() && tree().viewport()->rect().contains(rectangle.center());
}

void TopologyWindow::select(const QString &statement, int column) const
{
    const QModelIndex index{find(statement, column)};
    tree().scrollTo(index);
    QTest::mouseClick(tree().viewport(), Qt::LeftButton, {}, tree().visualRect(index).center());
    QCOMPARE(tree().currentIndex(), index);
}

void TopologyWindow::doubleClick(const QString &statement, int column) const
{
    select(statement, column);
    QTest::mouseDClick(tree().viewport(), Qt::LeftButton, {}, tree().visualRect(find(statement, column)).center());
}

void TopologyWindow::choose(ModalBoxes &boxes, const QString &statement, const QStringList &entries,
                            const std::function<void()> &expectAnswers) const
{
    const auto clickEntries = [entries](QMenu *menu) {
        for (const QString &entry : entries) {
            QAction *action{menu ? entryOf(*menu, entry) : nullptr};
            if (!action)
                qFatal("no entry \"%s\"", qPrintable(entry));
            QMenu *submenu{action->menu()};
            QTest::mouseClick(menu, Qt::LeftButton, {}, menu->actionGeometry(action).center());
            if (submenu)
                QTRY_VERIFY(submenu->isVisible());
            menu = submenu;
        }
    };
    openMenu(boxes, statement, clickEntries, expectAnswers);
}

void TopologyWindow::openMenu(ModalBoxes &boxes, const QString &statement, const std::function<void(QMenu *menu)> &use,
                              const std::function<void()> &expectAnswers) const
{
    const QModelIndex index{find(statement)};
    tree().scrollTo(index);
    boxes.expectMenu(use);
    if (expectAnswers)
        expectAnswers();
    QTest::mouseClick(window().windowHandle(), Qt::RightButton, {},
                      tree().viewport()->mapTo(&window(), tree().visualRect(index).center()));
    boxes.verify();
}

QByteArray TopologyWindow::content() const { return model().fileContent(); }

QStringList TopologyWindow::changes() const { return differences(placedLines(m_opened), placedLines(content())); }

QStringList TopologyWindow::shownChanges() const { return differences(m_shownAtFirst, shownRows(model())); }

bool TopologyWindow::offersSave() const { return action("aSave").isEnabled(); }

QByteArray TopologyWindow::saveToFile(ModalBoxes &boxes) const
{
    boxes.expectBox(saveQuestion(), QMessageBox::Save);
    QTest::keyClick(window().windowHandle(), Qt::Key_S, Qt::ControlModifier);
    boxes.verify();
    return readTestFile(paths::configuration());
}

QStringList shownIn(const QWidget &dialog)
{
    QStringList texts;
    appendShown(dialog, texts);
    return texts;
}

Fill type(const QStringList &texts)
{
    return [texts](ModalBoxes & /*boxes*/, QDialog * /*dialog*/) {
        for (int i{0}; i < texts.size(); ++i) {
            if (i > 0)
                driver::press(Qt::Key_Tab);
            if (!texts.at(i).isNull())
                driver::retype(texts.at(i));
        }
    };
}

Fill addAddresses(const QStringList &addresses)
{
    return [addresses](ModalBoxes &boxes, QDialog *dialog) {
        for (const QString &address : addresses) {
            boxes.expectDialog<IpInputDialog>([address](QDialog *ipDialog) {
                driver::retype(address);
                save(*ipDialog);
            });
            driver::click(driver::find<QPushButton>(*dialog, QStringLiteral("addButton")));
        }
    };
}

Fill typeInCell(int row, int column, const QString &text)
{
    return [=](ModalBoxes & /*boxes*/, QDialog *dialog) {
        auto *table = driver::find<QTableView>(*dialog);
        const QPoint center{table->visualRect(table->model()->index(row, column)).center()};
        QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, center);
        QTest::mouseDClick(table->viewport(), Qt::LeftButton, {}, center);
        QVERIFY(qobject_cast<QLineEdit *>(QApplication::focusWidget()));
        driver::retype(text);
        driver::press(Qt::Key_Return);
    };
}

Fill addRoute(const QStringList &cells, bool ms)
{
    return [=](ModalBoxes &boxes, QDialog *dialog) {
        driver::click(driver::find<QPushButton>(*dialog, QStringLiteral("addButton")));
        const int row{driver::find<QTableView>(*dialog)->model()->rowCount() - 1};
        for (int column{0}; column < cells.size(); ++column)
            typeInCell(row, column, cells.at(column))(boxes, dialog);
        auto *kind = driver::find<QCheckBox>(*dialog);
        if (kind->isChecked() != ms)
            QTest::mouseClick(kind, Qt::LeftButton, {}, QPoint{kind->height() / 2, kind->height() / 2});
    };
}

void save(const QDialog &dialog)
{
    const auto *buttons = driver::find<QDialogButtonBox>(dialog, QStringLiteral("buttonBox"));
    // The dialog of routes deliberately says Yes.
    const QDialogButtonBox::StandardButton accepting{buttons->button(QDialogButtonBox::Save) ? QDialogButtonBox::Save
                                                                                             : QDialogButtonBox::Yes};
    driver::click(dialog, accepting);
}

ModalBoxes::Box advancedBox()
{
    return {QMessageBox::Warning, QStringLiteral("Warning!"),
            QStringLiteral("This editing mode for advanced users.\n"
                           "After applying this changes configuration may be incorrect.\n"
                           "Do you want to resume?"),
            QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes};
}

void expectSaved(ModalBoxes &boxes, const Input &input, const QString &error)
{
    expectInput(boxes, input, [&boxes, error](QDialog *dialog) {
        if (!error.isEmpty())
            boxes.expectBox(errorBox(error), QMessageBox::Ok);
        save(*dialog);
    });
}

void expectCancelled(ModalBoxes &boxes, const Input &input)
{
    expectInput(boxes, input, [](QDialog *dialog) { driver::click(*dialog, QDialogButtonBox::Cancel); });
}
