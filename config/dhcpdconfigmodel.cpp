// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigmodel.h"

#include "common/fileio.h"
#include "common/vectorregisters.h"
#include "config/configreader.h"
#include "config/configwriter.h"

namespace {

QString iconName(const DhcpdConfigStatement &statement)
{
    if (statement.isRoot() || (statement.isDeclaration() && statement.isSharedNetwork()))
        return QStringLiteral("network");
    if (statement.isParam())
        return QStringLiteral("configure");
    if (statement.isHost())
        return QStringLiteral("computer");
    return QStringLiteral("preferences-system-network");
}

} // namespace

DhcpdConfigModel::DhcpdConfigModel(const QStringList &headerLabels, QObject *parent)
    : QAbstractItemModel{parent}
    , m_topNode{std::make_unique<DhcpdConfigDeclaration>(headerLabels, nullptr)}
{
}

QModelIndex DhcpdConfigModel::index(int row, int column, const QModelIndex &parent) const
{
    // As hasIndex(), but without counting the words of the parent for column 0: a view asks for it for every row.
    const DhcpdConfigStatement &holder{*statementFor(parent)};
    const bool hasColumn{column == 0 ? !holder.words().isEmpty() : column > 0 && column < columnCount(parent)};
    if (row < 0 || row >= rowCount(parent) || !hasColumn)
        return {};
    DhcpdConfigStatement *child{holder.child(row)};
    return child ? createIndex(row, column, child) : QModelIndex{};
}

QModelIndex DhcpdConfigModel::parent(const QModelIndex &index) const
{
    const DhcpdConfigDeclaration *parentNode{statementFor(index)->parent()};
    return parentNode ? indexOf(*parentNode) : QModelIndex{};
}

int DhcpdConfigModel::rowCount(const QModelIndex &parent) const
{
    return parent.column() > 0 ? 0 : statementFor(parent)->childCount();
}

int DhcpdConfigModel::columnCount(const QModelIndex &parent) const { return statementFor(parent)->wordCount(); }

bool DhcpdConfigModel::hasChildren(const QModelIndex &parent) const
{
    // As the base's, but without counting words: a view asks for it for every row.
    return rowCount(parent) > 0 && !statementFor(parent)->words().isEmpty();
}

Qt::ItemFlags DhcpdConfigModel::flags(const QModelIndex &index) const
{
    const bool isMarked{m_marksLeaves && !hasChildren(index)};
    return QAbstractItemModel::flags(index) | (isMarked ? Qt::ItemNeverHasChildren : Qt::NoItemFlags);
}

QVariant DhcpdConfigModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || !index.internalPointer())
        return {};
    const DhcpdConfigStatement &statement{*statementFor(index)};
    if (role == Qt::DisplayRole || role == Qt::EditRole)
        return statement.text(index.column());
    if (role == Qt::DecorationRole && index.column() == 0)
        return themeIcon(iconName(statement));
    return {};
}

QVariant DhcpdConfigModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return {};
    return m_topNode->word(section);
}

bool DhcpdConfigModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (role != Qt::EditRole || index.column() < 1)
        return false;
    DhcpdConfigStatement *statement{statementFor(index)};
    const QString text{value.toString()};
    const bool stored{statement->isParam()
                          ? setParamValue(static_cast<DhcpdConfigParam *>(statement), text)
                          : setDeclarationValue(static_cast<DhcpdConfigDeclaration *>(statement), text)};
    if (stored)
        setModified();
    return stored;
}

DhcpdConfigStatement *DhcpdConfigModel::statementFor(const QModelIndex &index) const
{
    if (!index.isValid() || !index.internalPointer())
        return m_topNode.get();
    return static_cast<DhcpdConfigStatement *>(index.internalPointer());
}

QModelIndex DhcpdConfigModel::indexOf(const DhcpdConfigStatement &statement, int column) const
{
    if (&statement == m_topNode.get())
        return {};
    // An index holds the statement as one that may be changed, and as a statement, whatever its class.
    return createIndex(statement.row(), column, const_cast<DhcpdConfigStatement *>(&statement));
}

bool DhcpdConfigModel::parse(const QString &text) { return parseUtf8(text.toUtf8()); }

QByteArray DhcpdConfigModel::fileContent() const
{
    if (m_topNode->childCount() == 0)
        return {};
    const QByteArray text{serialize(*m_topNode)};
    return text.isEmpty() ? text : m_encoding.fromUtf8(text);
}

void DhcpdConfigModel::reload(const QString &confFile)
{
    removeRows(0, rowCount());
    read(confFile);
}

void DhcpdConfigModel::reloadFrom(const std::optional<QByteArray> &content, const QString &confFile,
                                  const QString &reason)
{
    removeRows(0, rowCount());
    append(content, confFile, reason);
}

void DhcpdConfigModel::read(const QString &confFile)
{
    QString reason;
    const auto content = fileio::readFile(confFile, &reason);
    append(content, confFile, reason);
}

void DhcpdConfigModel::append(const std::optional<QByteArray> &content, const QString &confFile, const QString &reason)
{
    const TextEncoding encoding{content ? TextEncoding::detect(*content) : m_encoding};
    if (!content || !parseUtf8(encoding.toUtf8(*content))) {
        refuse(tr("Unable to open file '%1' for read").arg(confFile),
               content ? tr("The blocks of the file are nested too deeply.") : reason);
        return;
    }
    m_encoding = encoding;
    m_modified = false;
    emit dataChanged({}, {});
}

bool DhcpdConfigModel::write(const QString &confFile)
{
    // A tree without a top row was never read: nothing of it may replace a file that does hold something. Nor may a
    // text that could not be read again.
    const QByteArray content{fileContent()};
    QString reason;
    if (!content.isNull() && fileio::replaceFile(confFile, content, &reason))
        return true;
    reportUnwritten(confFile, reason);
    return false;
}

void DhcpdConfigModel::reportUnwritten(const QString &confFile, const QString &reason)
{
    refuse(tr("Unable to open file '%1' for write").arg(confFile), reason);
}

bool DhcpdConfigModel::parseUtf8(const QByteArray &text)
{
    clearVectorRegisters();
    auto allNetwork =
        readConfiguration({text.constData(), static_cast<std::size_t>(text.size())}, *m_topNode, &m_losses);
    if (!allNetwork)
        return false;
    m_topNode->addDeclaration(std::move(allNetwork));
    return true;
}

bool DhcpdConfigModel::refuse(const QString &message, const QString &reason)
{
    m_errorReason = reason;
    emit error(message);
    return false;
}

void DhcpdConfigModel::setModified()
{
    m_modified = true;
    emit dataChanged({}, {});
}

QIcon DhcpdConfigModel::themeIcon(const QString &name) const
{
    QIcon &icon{m_icons[name]};
    if (icon.isNull())
        icon = QIcon::fromTheme(name);
    return icon;
}
