// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/dhcpdleasesmodel.h"

#include "leases/leasefile.h"
#include "leases/leaseneedle.h"
#include "leases/leasesearch.h"

#include <array>

namespace {

constexpr std::array headers{
    QT_TRANSLATE_NOOP("DhcpdLeasesModel", "IP address"),   QT_TRANSLATE_NOOP("DhcpdLeasesModel", "MAC address"),
    QT_TRANSLATE_NOOP("DhcpdLeasesModel", "Host name"),    QT_TRANSLATE_NOOP("DhcpdLeasesModel", "Binding state"),
    QT_TRANSLATE_NOOP("DhcpdLeasesModel", "Rental start"), QT_TRANSLATE_NOOP("DhcpdLeasesModel", "Rental end"),
};
constexpr int columns{headers.size()};

// What is appended beyond this is announced as one reset, before it is read.
constexpr qint64 mostBytesAnnounced{qint64{1} << 20};
// More ranges of new rows than these are announced as one reset as well: over a million leases each costs the filter
// and the view an eighth of what a reset does.
constexpr std::size_t mostRangesAnnounced{8};
// Changed rows that are at most so far apart are announced together with those between.
constexpr int widestGap{8};

} // namespace

DhcpdLeasesModel::DhcpdLeasesModel(QObject *parent)
    : QAbstractListModel{parent}
{
}

int DhcpdLeasesModel::rowCount(const QModelIndex &parent) const { return parent.isValid() ? 0 : m_table.size(); }

int DhcpdLeasesModel::columnCount(const QModelIndex & /*parent*/) const { return columns; }

QVariant DhcpdLeasesModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.row() >= m_table.size())
        return {};
    const Lease &lease{m_table.at(index.row())};
    if (role == AddressRole)
        return lease.address;
    return role == Qt::DisplayRole || role == Qt::EditRole ? text(lease, index.column()) : QVariant{};
}

QVariant DhcpdLeasesModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (role != Qt::DisplayRole)
        return {};
    if (orientation == Qt::Vertical)
        return section; // deliberately from 0 on
    return section >= 0 && section < columns ? tr(headers[static_cast<std::size_t>(section)]) : QVariant{};
}

std::unique_ptr<LeaseSearch> DhcpdLeasesModel::search(const LeaseNeedle &needle) const
{
    return std::make_unique<LeaseSearch>(m_table, m_timeTexts, needle);
}

qint64 DhcpdLeasesModel::bytesToRead(const QString &path) const
{
    const LeaseFile file{path};
    return m_reader.continues(file) ? file.size() - m_reader.position() : file.size();
}

void DhcpdLeasesModel::reload(const QString &path)
{
    beginResetModel();
    m_reader.clear();
    const bool isRead{m_reader.readOn(LeaseFile{path})};
    if (!isRead)
        m_reader.clear();
    m_table.settleAll();
    endResetModel();
    if (!isRead)
        emit error(tr("Unable to open file '%1' for read").arg(path));
}

void DhcpdLeasesModel::update(const QString &path)
{
    const LeaseFile file{path};
    if (!m_reader.continues(file)) {
        reload(path);
        return;
    }
    const bool isMuch{file.size() - m_reader.position() > mostBytesAnnounced};
    if (isMuch)
        beginResetModel();
    const bool isRead{m_reader.readOn(file)};
    if (isMuch) {
        m_table.settleAll();
        endResetModel();
    } else {
        settle();
    }
    if (!isRead)
        reload(path);
}

QString DhcpdLeasesModel::text(const Lease &lease, int column) const
{
    const auto decoded = [this, column](LeaseTexts::Id id) {
        return decodeLeaseText(m_table.texts(static_cast<LeaseColumn>(column)).at(id));
    };
    switch (column) {
    case Address:
        return m_table.addressText(lease.address);
    case Mac:
        return decoded(lease.mac);
    case HostName:
        return decoded(lease.host);
    case State:
        return decoded(lease.state);
    case Start:
        return m_timeTexts.text(lease.start);
    default:
        return m_timeTexts.text(lease.end);
    }
}

void DhcpdLeasesModel::settle()
{
    announceChanged(m_table.settleKnown());
    const std::vector<LeaseTable::Rows> ranges{m_table.newRows()};
    if (ranges.size() > mostRangesAnnounced) {
        beginResetModel();
        m_table.settleAll();
        endResetModel();
        return;
    }
    for (const LeaseTable::Rows &rows : ranges) {
        beginInsertRows({}, rows.first, rows.first + rows.count - 1);
        m_table.settleFirst(rows);
        endInsertRows();
    }
}

void DhcpdLeasesModel::announceChanged(const std::vector<int> &rows)
{
    for (auto first = rows.cbegin(); first != rows.cend();) {
        auto last = first;
        while (last + 1 != rows.cend() && *(last + 1) - *last <= widestGap)
            ++last;
        emit dataChanged(index(*first, 0), index(*last, columns - 1));
        first = last + 1;
    }
}
