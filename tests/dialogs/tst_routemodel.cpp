// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/routemodel.h"
#include "tests/support/contexttranslator.h"

#include <QAbstractItemModelTester>
#include <QMetaMethod>
#include <QSignalSpy>
#include <QTest>

namespace {

QStringList texts(const RouteModel &model)
{
    QStringList result;
    for (int row{0}; row < model.rowCount(); ++row) {
        for (int column{0}; column < model.columnCount(); ++column)
            result.append(model.index(row, column).data().toString());
    }
    return result;
}

const QStringList twoRoutes{QStringLiteral("255.255.255.0"), QStringLiteral("192.168.1.0"),
                            QStringLiteral("192.168.1.1"),   QStringLiteral("255.0.0.0"),
                            QStringLiteral("10.0.0.0"),      QStringLiteral("10.0.0.1")};

} // namespace

class RouteModelTest final : public QObject
{
    Q_OBJECT

private slots:
    void startsEmptyWithThreeColumns();
    void headerCountsRowsFromZero_data();
    void headerCountsRowsFromZero();
    void titlesAreTranslatedInTheContextOfTableModels();
    void addedRoutesAreAnnouncedOneByOneAtTheEnd();
    void lastRowMayBeIncomplete_data();
    void lastRowMayBeIncomplete();
    void showsOnlyDottedNumbers_data();
    void showsOnlyDottedNumbers();
    void showsNothingOutsideItsRowsAndRoles();
    void storesEditedTexts();
    void refusesOtherRolesAndIndexes();
    void cellsAreEditable();
    void removesARowInsideAReset();
    void removingNothingChangesNothing();
    void declaresEditCompleted();
};

void RouteModelTest::startsEmptyWithThreeColumns()
{
    const RouteModel model;
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.columnCount(), 3);
}

void RouteModelTest::headerCountsRowsFromZero_data()
{
    QTest::addColumn<int>("section");
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<int>("role");
    QTest::addColumn<QVariant>("expected");
    QTest::addRow("net mask") << 0 << Qt::Horizontal << int{Qt::DisplayRole} << QVariant{QStringLiteral("Net mask")};
    QTest::addRow("net") << 1 << Qt::Horizontal << int{Qt::DisplayRole} << QVariant{QStringLiteral("IP net")};
    QTest::addRow("gateway") << 2 << Qt::Horizontal << int{Qt::DisplayRole} << QVariant{QStringLiteral("Gateway")};
    QTest::addRow("beyond") << 3 << Qt::Horizontal << int{Qt::DisplayRole} << QVariant{};
    QTest::addRow("before") << -1 << Qt::Horizontal << int{Qt::DisplayRole} << QVariant{};
    QTest::addRow("first row") << 0 << Qt::Vertical << int{Qt::DisplayRole} << QVariant{0};
    QTest::addRow("eighth row") << 7 << Qt::Vertical << int{Qt::DisplayRole} << QVariant{7};
    QTest::addRow("column tool tip") << 0 << Qt::Horizontal << int{Qt::ToolTipRole} << QVariant{};
    QTest::addRow("row edit") << 0 << Qt::Vertical << int{Qt::EditRole} << QVariant{};
}

void RouteModelTest::headerCountsRowsFromZero()
{
    QFETCH(int, section);
    QFETCH(Qt::Orientation, orientation);
    QFETCH(int, role);
    QTEST(RouteModel{}.headerData(section, orientation, role), "expected");
}

void RouteModelTest::titlesAreTranslatedInTheContextOfTableModels()
{
    ContextTranslator translator;
    QCoreApplication::installTranslator(&translator);
    QCOMPARE(RouteModel{}.headerData(1, Qt::Horizontal).toString(), QStringLiteral("QAbstractTableModel|IP net"));
}

void RouteModelTest::addedRoutesAreAnnouncedOneByOneAtTheEnd()
{
    RouteModel model;
    const QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    QSignalSpy inserted{&model, &QAbstractItemModel::rowsInserted};
    model.addRoutes(twoRoutes);
    QCOMPARE(inserted.count(), 2);
    for (int row{0}; row < 2; ++row) {
        QCOMPARE(inserted.at(row).at(0).toModelIndex(), QModelIndex{});
        QCOMPARE(inserted.at(row).at(1).toInt(), row);
        QCOMPARE(inserted.at(row).at(2).toInt(), row);
    }
    QCOMPARE(texts(model), twoRoutes);

    model.addRoutes(twoRoutes.mid(0, 3));
    QCOMPARE(model.rowCount(), 3);
    QCOMPARE(inserted.at(2).at(1).toInt(), 2);
    QCOMPARE(texts(model), twoRoutes + twoRoutes.mid(0, 3));
}

void RouteModelTest::lastRowMayBeIncomplete_data()
{
    QTest::addColumn<int>("words");
    QTest::addColumn<int>("rows");
    for (const auto &[words, rows] : {std::pair{0, 0}, {1, 1}, {2, 1}, {3, 1}, {4, 2}, {5, 2}, {6, 2}})
        QTest::addRow("%d words", words) << words << rows;
}

void RouteModelTest::lastRowMayBeIncomplete()
{
    QFETCH(int, words);
    QFETCH(int, rows);
    RouteModel model;
    model.addRoutes(twoRoutes.mid(0, words));
    QStringList expected{twoRoutes.mid(0, words)};
    while (expected.size() < rows * 3)
        expected.append(QString{});
    QCOMPARE(model.rowCount(), rows);
    QCOMPARE(texts(model), expected);
}

void RouteModelTest::showsOnlyDottedNumbers_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("shown");
    QTest::addRow("address") << QStringLiteral("10.0.0.1") << true;
    QTest::addRow("unfinished address") << QStringLiteral("10.") << true;
    QTest::addRow("octet anywhere") << QStringLiteral("net 10.x") << true;
    QTest::addRow("words") << QStringLiteral("abc") << false;
    QTest::addRow("plain number") << QStringLiteral("24") << false;
    QTest::addRow("long number") << QStringLiteral("1024.") << false;
    QTest::addRow("empty") << QString{} << false;
}

void RouteModelTest::showsOnlyDottedNumbers()
{
    QFETCH(QString, text);
    QFETCH(bool, shown);
    RouteModel model;
    model.addRoutes({text, text, text});
    for (const int role : {Qt::DisplayRole, Qt::EditRole}) {
        for (int column{0}; column < 3; ++column)
            QCOMPARE(model.index(0, column).data(role), QVariant{shown ? text : QString{}});
    }
}

void RouteModelTest::showsNothingOutsideItsRowsAndRoles()
{
    RouteModel model;
    model.addRoutes(twoRoutes);
    for (const int role : {Qt::DecorationRole, Qt::ToolTipRole, Qt::TextAlignmentRole, Qt::CheckStateRole})
        QCOMPARE(model.index(0, 0).data(role), QVariant{});
    QCOMPARE(model.data(QModelIndex{}), QVariant{});
    const QModelIndex second{model.index(1, 0)};
    model.removeRoute(model.index(0, 0));
    QCOMPARE(model.data(second), QVariant{});
}

void RouteModelTest::storesEditedTexts()
{
    RouteModel model;
    const QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    model.addRoutes({QString{}, QString{}, QString{}});
    QSignalSpy changed{&model, &QAbstractItemModel::dataChanged};
    const QModelIndex cell{model.index(0, 1)};
    QVERIFY(model.setData(cell, QStringLiteral("10.0.0.0")));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.at(0).at(0).toModelIndex(), cell);
    QCOMPARE(changed.at(0).at(1).toModelIndex(), cell);
    QCOMPARE(texts(model), (QStringList{QString{}, QStringLiteral("10.0.0.0"), QString{}}));
}

void RouteModelTest::refusesOtherRolesAndIndexes()
{
    RouteModel model;
    model.addRoutes(twoRoutes);
    QSignalSpy changed{&model, &QAbstractItemModel::dataChanged};
    QVERIFY(!model.setData(model.index(0, 0), QStringLiteral("1.1.1.1"), Qt::DisplayRole));
    QVERIFY(!model.setData(QModelIndex{}, QStringLiteral("1.1.1.1")));
    QVERIFY(!model.setData(model.index(2, 0), QStringLiteral("1.1.1.1")));
    QCOMPARE(changed.count(), 0);
    QCOMPARE(texts(model), twoRoutes);
}

void RouteModelTest::cellsAreEditable()
{
    RouteModel model;
    model.addRoutes(twoRoutes);
    QCOMPARE(model.flags(model.index(1, 2)),
             Qt::ItemIsSelectable | Qt::ItemIsEnabled | Qt::ItemIsEditable | Qt::ItemNeverHasChildren);
}

void RouteModelTest::removesARowInsideAReset()
{
    RouteModel model;
    model.addRoutes(twoRoutes);
    QSignalSpy aboutToReset{&model, &QAbstractItemModel::modelAboutToBeReset};
    QSignalSpy reset{&model, &QAbstractItemModel::modelReset};
    QSignalSpy removed{&model, &QAbstractItemModel::rowsRemoved};
    model.removeRoute(model.index(0, 2));
    QCOMPARE(aboutToReset.count(), 1);
    QCOMPARE(reset.count(), 1);
    QCOMPARE(removed.count(), 0);
    QCOMPARE(texts(model), twoRoutes.mid(3));
}

void RouteModelTest::removingNothingChangesNothing()
{
    RouteModel model;
    model.addRoutes(twoRoutes);
    const QModelIndex second{model.index(1, 0)};
    model.removeRoute(model.index(0, 0));
    QSignalSpy reset{&model, &QAbstractItemModel::modelReset};
    model.removeRoute(QModelIndex{});
    model.removeRoute(second);
    QCOMPARE(reset.count(), 0);
    QCOMPARE(texts(model), twoRoutes.mid(3));
}

void RouteModelTest::declaresEditCompleted()
{
    const QMetaObject &meta{RouteModel::staticMetaObject};
    bool found{false};
    for (int i{meta.methodOffset()}; i < meta.methodCount(); ++i)
        found |= meta.method(i).name() == "editCompleted" && meta.method(i).methodType() == QMetaMethod::Signal;
    QVERIFY(found);
}

QTEST_GUILESS_MAIN(RouteModelTest)
#include "tst_routemodel.moc"
