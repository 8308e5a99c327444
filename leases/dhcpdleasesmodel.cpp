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

// More than this, some ten blocks, is announced as one reset: each row announced costs its views more than that.
constexpr qint64 mostAnnouncedByRow{4096};

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
    const bool isAnnouncedByRow{file.size() - m_reader.position() <= mostAnnouncedByRow};
    if (!isAnnouncedByRow)
        beginResetModel();
    const bool isRead{m_reader.readOn(file)};
    if (isAnnouncedByRow) {
        settleOneByOne();
    } else {
        m_table.settleAll();
        endResetModel();
    }
    if (!isRead)
        reload(path);
}

QString DhcpdLeasesModel::text(const Lease &lease, int column) const
{
    const auto decoded = [this](LeaseTexts::Id id) { return decodeLeaseText(m_table.texts().at(id)); };
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

void DhcpdLeasesModel::settleOneByOne()
{
    while (m_table.hasPending()) {
        const auto [row, isNew] = m_table.placeOfNext();
        if (isNew) {
            beginInsertRows({}, row, row);
            m_table.settleNext();
            endInsertRows();
        } else {
            m_table.settleNext();
            emit dataChanged(index(row, 0), index(row, columns - 1));
        }
    }
}
