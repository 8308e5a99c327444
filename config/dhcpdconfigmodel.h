// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/paths.h"
#include "common/textencoding.h"
#include "config/dhcpdconfigdeclaration.h"

#include <QAbstractItemModel>
#include <QHash>
#include <QIcon>
#include <QStringList>
#include <QVariant>

#include <memory>

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
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    /// Gives a statement a new value after checking it.
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;
    bool removeRows(int row, int count, const QModelIndex &parent = {}) override;

    /// The statement of `index`; the invisible top node for an invalid one.
    DhcpdConfigStatement *statementFor(const QModelIndex &index) const;
    /// Whether the tree has changed since it was read.
    bool isModified() const { return m_modified; }

    /// Appends what `text` holds; false, with nothing appended, when its blocks are nested too deep.
    bool parse(const QString &text);
    /// The bytes that write() puts into the file.
    QByteArray fileContent() const;

    /// Takes a statement with everything under it out of the tree.
    void removeStatement(const QModelIndex &index);

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
    void setModified();
    QIcon themeIcon(const QString &name) const;

    bool setParamValue(DhcpdConfigParam *param, const QVariant &value);
    bool setDeclarationValue(DhcpdConfigDeclaration *declaration, const QVariant &value);

    // These check a value, and those named set… store it; they report a refusal as error() and return false.
    bool checkOptionValue(const DhcpdConfigParam &option, const QString &text);
    bool setSubnetValue(DhcpdConfigStatement *statement, const QString &text);
    bool setIpValue(DhcpdConfigStatement *statement, const QString &text);
    bool setMacValue(DhcpdConfigStatement *statement, const QString &text);
    bool setRangeValue(DhcpdConfigStatement *statement, const QString &text);
    /// Emits error() and returns false.
    bool refuse(const QString &message);

    std::unique_ptr<DhcpdConfigDeclaration> m_topNode; // invisible; its words are the header labels
    bool m_modified{};
    TextEncoding m_encoding; // of the file that was read last
    mutable QHash<QString, QIcon> m_icons;
};
