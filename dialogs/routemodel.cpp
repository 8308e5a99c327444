// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/routemodel.h"

#include "dialogs/patterns.h"

#include <QRegularExpression>

namespace {

constexpr int columns{3};

QString columnTitle(int column)
{
    switch (column) {
    case 0:
        return QAbstractTableModel::tr("Net mask");
    case 1:
        return QAbstractTableModel::tr("IP net");
    case 2:
        return QAbstractTableModel::tr("Gateway");
    default:
        return {};
    }
}

} // namespace

RouteModel::RouteModel(QObject *parent)
    : QAbstractTableModel{parent}
{
}

int RouteModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(m_rows.size());
}

int RouteModel::columnCount(const QModelIndex &parent) const { return parent.isValid() ? 0 : columns; }

QVariant RouteModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (role != Qt::DisplayRole)
        return {};
    if (orientation == Qt::Vertical)
        return section;
    const QString title{columnTitle(section)};
    return title.isEmpty() ? QVariant{} : title;
}

QVariant RouteModel::data(const QModelIndex &index, int role) const
{
    if ((role != Qt::DisplayRole && role != Qt::EditRole) || !hasRow(index))
        return {};
    const QString text{m_rows.at(index.row()).value(index.column()).toString()};
    return text.contains(patterns::octet()) ? text : QString{};
}

bool RouteModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (role != Qt::EditRole || !hasRow(index))
        return false;
    m_rows[index.row()].insert(index.column(), value.toString());
    emit dataChanged(index, index);
    return true;
}

Qt::ItemFlags RouteModel::flags(const QModelIndex &index) const
{
    const Qt::ItemFlags flags{QAbstractTableModel::flags(index)};
    return index.isValid() ? flags | Qt::ItemIsEditable : flags;
}

void RouteModel::addRoutes(const QStringList &words)
{
    for (int first{0}; first < words.size(); first += columns) {
        Row row;
        for (int column{0}; column < columns && first + column < words.size(); ++column)
            row.insert(column, words.at(first + column));
        beginInsertRows({}, rowCount(), rowCount());
        m_rows.append(row);
        endInsertRows();
    }
}

void RouteModel::removeRoute(const QModelIndex &index)
{
    if (!hasRow(index))
        return;
    beginResetModel();
    m_rows.removeAt(index.row());
    endResetModel();
}

bool RouteModel::hasRow(const QModelIndex &index) const { return index.isValid() && index.row() < m_rows.size(); }
