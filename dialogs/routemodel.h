// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QAbstractTableModel>
#include <QList>
#include <QMap>
#include <QVariant>

/// The static routes as an editable table: net mask, network and gateway, in the order of the option's encoding.
class RouteModel final : public QAbstractTableModel
{
    Q_OBJECT

public:
    explicit RouteModel(QObject *parent = nullptr);
    Q_DISABLE_COPY_MOVE(RouteModel)

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    /// The vertical header deliberately counts from 0.
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    /// The text of a cell; empty as long as it does not look like a dotted number.
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;

    /// Appends a row for every three words; where there are too few for the last row, its cells stay empty.
    void addRoutes(const QStringList &words);
    /// Removes the row of `index`, if there is one.
    void removeRoute(const QModelIndex &index);

signals:
    /// Deliberately never emitted.
    void editCompleted(const QString &text);

private:
    /// The values of a row by column; a cell without a value is empty.
    using Row = QMap<int, QVariant>;

    bool hasRow(const QModelIndex &index) const;

    QList<Row> m_rows;
};
