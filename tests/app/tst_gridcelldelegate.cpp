// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/gridcelldelegate.h"

#include <QHeaderView>
#include <QStandardItemModel>
#include <QTableView>
#include <QTest>

namespace {

class Leases final : public QStandardItemModel
{
public:
    Leases()
        : QStandardItemModel{3, 2}
    {
        for (int row{0}; row < rowCount(); ++row) {
            for (int column{0}; column < columnCount(); ++column)
                setItem(row, column, new QStandardItem{QStringLiteral("10.0.%1.%2").arg(row).arg(column)});
        }
    }
};

} // namespace

class GridCellDelegateTest final : public QObject
{
    Q_OBJECT

private slots:
    void looksAsTheTablesOwnGrid_data();
    void looksAsTheTablesOwnGrid();
    void measuresAsTheTableDoes();
};

void GridCellDelegateTest::looksAsTheTablesOwnGrid_data()
{
    QTest::addColumn<Qt::LayoutDirection>("direction");
    QTest::addColumn<int>("selectedRow");
    QTest::newRow("left to right") << Qt::LeftToRight << -1;
    QTest::newRow("a selected row") << Qt::LeftToRight << 1;
    QTest::newRow("right to left") << Qt::RightToLeft << -1;
    QTest::newRow("right to left, a selected row") << Qt::RightToLeft << 1;
}

void GridCellDelegateTest::looksAsTheTablesOwnGrid()
{
    QFETCH(const Qt::LayoutDirection, direction);
    QFETCH(const int, selectedRow);
    Leases leases;
    QTableView table;
    table.setLayoutDirection(direction);
    table.setSelectionBehavior(QAbstractItemView::SelectRows);
    table.setModel(&leases);
    table.resize(300, 200);
    if (selectedRow >= 0)
        table.selectRow(selectedRow);

    const QImage withItsOwn{table.grab().toImage()};
    table.setShowGrid(false);
    QVERIFY(table.grab().toImage() != withItsOwn);
    new GridCellDelegate{&table};
    QCOMPARE(table.grab().toImage(), withItsOwn);
}

void GridCellDelegateTest::measuresAsTheTableDoes()
{
    Leases leases;
    QTableView table;
    table.setModel(&leases);
    const auto sizes = [&table] {
        table.resizeColumnsToContents();
        table.resizeRowsToContents();
        return QSize{table.horizontalHeader()->length(), table.verticalHeader()->length()};
    };
    const QSize withItsOwnGrid{sizes()};
    new GridCellDelegate{&table};
    QCOMPARE(sizes(), withItsOwnGrid);
}

QTEST_MAIN(GridCellDelegateTest)
#include "tst_gridcelldelegate.moc"
