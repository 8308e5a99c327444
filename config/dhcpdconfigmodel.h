// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/paths.h"
#include "common/textencoding.h"
#include "config/dhcpdconfigdeclaration.h"
#include "config/parameterkind.h"
#include "config/readinglosses.h"

#include <QAbstractItemModel>
#include <QHash>
#include <QIcon>
#include <QStringList>
#include <QVariant>

#include <memory>
#include <optional>

/// The DHCP server's configuration as a tree of statements with a label and a value, its file, and every way to edit
/// it. What the user must know of a failure or a refusal travels as error().
///
/// A change, a read included, is told as dataChanged() with two invalid indexes, which means everything.
class DhcpdConfigModel final : public QAbstractItemModel
{
    Q_OBJECT

public:
    explicit DhcpdConfigModel(const QStringList &headerLabels, QObject *parent = nullptr);

    QModelIndex index(int row, int column, const QModelIndex &parent = {}) const override;
    QModelIndex parent(const QModelIndex &index) const override;
    using QObject::parent;
    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    bool hasChildren(const QModelIndex &parent = {}) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    /// Gives a statement a new value after checking it.
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;
    bool removeRows(int row, int count, const QModelIndex &parent = {}) override;

    /// The statement of `index`; the invisible top node for an invalid one.
    DhcpdConfigStatement *statementFor(const QModelIndex &index) const;
    /// The index of a statement of the tree in `column`; invalid for the invisible top node.
    QModelIndex indexOf(const DhcpdConfigStatement &statement, int column = 0) const;
    /// While leaves are marked, the flags of a statement without children have Qt::ItemNeverHasChildren, which spares a
    /// view that opens all others a search for it. They are not marked at first, since statements come and go.
    void markLeaves(bool isMarked) { m_marksLeaves = isMarked; }
    /// Whether the tree has changed since it was read.
    bool isModified() const { return m_modified; }

    /// Appends what `text` holds; false, with nothing appended, when its blocks are nested too deep.
    bool parse(const QString &text);
    /// What of the text that was read last the tree does not keep.
    const ReadingLosses &losses() const { return m_losses; }
    /// The bytes that write() puts into the file; null when nothing was read, or they could not be read again.
    QByteArray fileContent() const;
    /// As reload(), of what was read from the file already; nothing where it could not be read, for that `reason`.
    void reloadFrom(const std::optional<QByteArray> &content, const QString &confFile, const QString &reason);
    /// Reports as write() does that the file could not be written, for the system's `reason`.
    void reportUnwritten(const QString &confFile, const QString &reason);
    /// While an error() is reported: the system's reason for it; empty where there is none.
    const QString &errorReason() const { return m_errorReason; }

    // The operations below add statements at the end of those of their sort under the statement of `parent`. What they
    // refuse, with an error(), changes nothing. A parent too deep to hold blocks is refused like one of the wrong kind.
    // A reset tells of statements that came or went.

    void addSharedNetwork(const QString &name, const QModelIndex &parent);
    /// `mask` is a netmask, a prefix length, or empty when `address` has one.
    void addSubnet(const QString &address, const QString &mask, const QModelIndex &parent);
    /// The first and the last address for hosts in the subnet that the text names; both empty when it names none.
    static QStringList defaultRange(const QString &subnet);
    void addRange(const QString &start, const QString &end, const QModelIndex &parent);
    /// `mac` and `address` may be empty. An invalid one does not stop the host: it becomes all zeros, or is left out.
    void addHost(const QString &name, const QString &mac, const QString &address, const QModelIndex &parent);
    /// Replaces the address that the host has already.
    void addFixedAddress(const QString &address, const QModelIndex &parent);
    /// Adds zones and keys for dynamic DNS updates: what bind9::prepared() returns.
    bool addBind9(const QStringList &statements, const QModelIndex &parent);
    bool addDeclaration(const QStringList &words, const QModelIndex &parent);
    bool addParameter(const QStringList &words, const QModelIndex &parent);

    /// Gives the declaration a parameter of that kind, or the first one that it has the new value. Each of the
    /// operations below is this for one kind.
    bool setParameter(const ParameterKind &kind, const QString &value, const QModelIndex &parent);
    bool addLeaseTime(const QString &keyword, const QString &seconds, const QModelIndex &parent);
    bool addDefaultLeaseTime(const QString &seconds, const QModelIndex &parent);
    bool addMaxLeaseTime(const QString &seconds, const QModelIndex &parent);
    /// Lists are addresses with commas between them.
    void addRouters(const QString &list, const QModelIndex &parent);
    void addDnsServers(const QString &list, const QModelIndex &parent);
    void addNtpServers(const QString &list, const QModelIndex &parent);
    /// `name` comes with its double quotes.
    void addDomainName(const QString &name, const QModelIndex &parent);

    /// Adds the value of the option for routes, and its definition unless the declaration or the one around it has it.
    void addStaticRoutes(const QStringList &routes, bool ms, const QModelIndex &parent);
    /// The same, with the definition at the top of the file, where alone the server takes it.
    void addRoutes(const QStringList &routes, bool ms, const QModelIndex &parent);

    /// Puts `words` in the place of all words of a statement, without a reset; nothing is modified when it has them
    /// already. False for the nodes above the file's statements, and, with an error(), where a line would become a
    /// block that is nested too deep.
    bool replaceWords(const QModelIndex &index, const QStringList &words);
    /// Takes a statement with everything under it out of the tree.
    void removeStatement(const QModelIndex &index);

    /// The names, without quotes, of the keys that zones added under `parent` can refer to: the server knows those that
    /// are declared before.
    QStringList keyNames(const QModelIndex &parent = {}) const;

signals:
    /// A message for the user.
    void error(const QString &message);

public slots:
    /// Reads the file anew. When that fails the model stays empty and modified.
    void reload(const QString &confFile = paths::configuration());
    /// Appends what the file holds, and takes the tree as unmodified.
    void read(const QString &confFile = paths::configuration());
    /// Replaces the file; the tree stays modified. False when it failed, and when there is nothing that was read.
    bool write(const QString &confFile = paths::configuration());

private:
    bool parseUtf8(const QByteArray &text);
    void append(const std::optional<QByteArray> &content, const QString &confFile, const QString &reason);
    void setModified();
    /// Runs `change`, which removes statements, within a reset.
    template<typename Change>
    void changeTree(Change change);
    /// Runs `change`, which adds statements to `holder`, within a reset.
    template<typename Change>
    void addTo(DhcpdConfigDeclaration *holder, Change change);
    /// The declaration of `index`; null when its statement is a parameter.
    DhcpdConfigDeclaration *declarationFor(const QModelIndex &index) const;
    /// The same, and null also when a block there would be nested too deep.
    DhcpdConfigDeclaration *holderFor(const QModelIndex &index) const;
    QString keywordFor(const QModelIndex &index) const { return statementFor(index)->keyword(); }
    QIcon themeIcon(const QString &name) const;

    /// The message for a value that is not valid.
    static QString invalidValue(ValueType type, const QString &text);
    // These check a value and store it; they report a refusal as error() and return false.
    bool setParamValue(DhcpdConfigParam *param, const QString &text);
    bool setDeclarationValue(DhcpdConfigDeclaration *declaration, const QString &text);
    bool setSubnetValue(DhcpdConfigDeclaration *subnet, const QString &text);
    bool setAddressValue(DhcpdConfigDeclaration *fixedAddress, const QString &text);
    bool setRangeValue(DhcpdConfigDeclaration *range, const QString &text);

    /// Emits error() and returns false.
    bool refuse(const QString &message, const QString &reason = {});

    std::unique_ptr<DhcpdConfigDeclaration> m_topNode; // invisible; its words are the header labels
    bool m_modified{};
    bool m_marksLeaves{};
    QString m_errorReason;
    ReadingLosses m_losses;
    TextEncoding m_encoding; // of the file that was read last
    mutable QHash<QString, QIcon> m_icons;
};

template<typename Change>
void DhcpdConfigModel::changeTree(Change change)
{
    beginResetModel();
    change();
    endResetModel();
    setModified();
}

template<typename Change>
void DhcpdConfigModel::addTo(DhcpdConfigDeclaration *holder, Change change)
{
    changeTree([&] {
        change();
        holder->setBraced(); // its children are to be written, whatever its keyword is
    });
}
