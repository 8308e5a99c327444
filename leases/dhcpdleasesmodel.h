// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/lease.h"
#include "leases/leasereader.h"
#include "leases/leasetable.h"
#include "leases/leasetimetexts.h"

#include <QAbstractListModel>
#include <QString>

#include <memory>

class LeaseSearch;
struct LeaseNeedle;

/// The leases of the DHCP server's lease file, a row for each address in the order of the addresses. It has six columns
/// although it is a list: address, MAC address, host name, binding state, start and end.
class DhcpdLeasesModel final : public QAbstractListModel
{
    Q_OBJECT

public:
    /// The columns, as numbers for an index.
    enum Column
    {
        Address = static_cast<int>(LeaseColumn::Address),
        Mac = static_cast<int>(LeaseColumn::Mac),
        HostName = static_cast<int>(LeaseColumn::HostName),
        State = static_cast<int>(LeaseColumn::State),
        Start = static_cast<int>(LeaseColumn::Start),
        End = static_cast<int>(LeaseColumn::End)
    };

    /// The address as a quint32, by which the rows are ordered; in every column.
    static constexpr int AddressRole{Qt::UserRole + 1};

    explicit DhcpdLeasesModel(QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

    /// A search in the texts that the model shows; not to be used after the model is gone.
    std::unique_ptr<LeaseSearch> search(const LeaseNeedle &needle) const;

    /// How much update() has to read: what was appended to the file at `path`, or all of it.
    qint64 bytesToRead(const QString &path) const;

signals:
    /// The file could not be read, and the model is empty; `message` is for the user.
    void error(const QString &message);

public slots:
    /// Replaces everything with what the file at `path` holds, in one reset.
    void reload(const QString &path);

    /// Brings the model up to date with the file at `path`. If the file has only grown since it was last read, just
    /// what was appended is read, and what it changed is announced as ranges of changed and of inserted rows; a reset
    /// announces more than a little of it, and what is no addition is a reload.
    void update(const QString &path);

private:
    QString text(const Lease &lease, int column) const;
    void settle();
    void announceChanged(const std::vector<int> &rows);

    LeaseTable m_table;
    LeaseReader m_reader{m_table};
    mutable LeaseTimeTexts m_timeTexts;
};
