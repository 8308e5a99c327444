// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/editsequence.h"

#include "common/textencoding.h"
#include <QTest>

#include <functional>
#include <vector>

namespace {

QString oneOf(Choices &choices, std::initializer_list<const char *> texts)
{
    return QString::fromUtf8(*(texts.begin() + choices.below(static_cast<int>(texts.size()))));
}

QString anyAddress(Choices &choices)
{
    return oneOf(choices, {"10.0.0.7", "10.0.0.9", "10.1.0.3", "0.0.0.0", "127.0.0.1", "", "x"});
}

QStringList anyWords(Choices &choices)
{
    QStringList words{oneOf(choices, {"pool", "group", "host", "subnet", "shared-network", "option", "x", "Key"})};
    for (int count{choices.below(4)}; count > 0; --count)
        words += oneOf(choices, {"a", "10.0.0.0", "netmask", "255.0.0.0", "domain-name", "routers", "\"q\""});
    return words;
}

QVector<QModelIndex> indexesUnder(const DhcpdConfigModel &model, const QModelIndex &parent)
{
    QVector<QModelIndex> indexes;
    for (int row{}; row < model.rowCount(parent); ++row) {
        const QModelIndex index{model.index(row, 0, parent)};
        indexes += index;
        indexes += indexesUnder(model, index);
    }
    return indexes;
}

const std::vector<std::function<void(DhcpdConfigModel &, const QModelIndex &, Choices &)>> edits{
    [](auto &model, const auto &index, Choices &choices) {
        model.addSharedNetwork(oneOf(choices, {"a", "b", ""}), index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        model.addSubnet(anyAddress(choices), oneOf(choices, {"24", "255.255.0.0", "33", ""}), index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        model.addRange(oneOf(choices, {"10.0.0.7", "10.1.0.7"}), oneOf(choices, {"10.0.0.9", "10.1.0.9", "x"}), index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        model.addHost(oneOf(choices, {"a", "b c", ""}), oneOf(choices, {"00:11:22:33:44:55", "zz", ""}),
                      anyAddress(choices), index);
    },
    [](auto &model, const auto &index, Choices &choices) { model.addFixedAddress(anyAddress(choices), index); },
    [](auto &model, const auto &index, Choices &choices) { model.addDeclaration(anyWords(choices), index); },
    [](auto &model, const auto &index, Choices &choices) { model.addParameter(anyWords(choices), index); },
    [](auto &model, const auto &index, Choices &choices) {
        model.addDefaultLeaseTime(oneOf(choices, {"600", "0", "7"}), index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        model.addMaxLeaseTime(oneOf(choices, {"600", "0"}), index);
    },
    [](auto &model, const auto &index, Choices &choices) { model.addRouters(anyAddress(choices), index); },
    [](auto &model, const auto &index, Choices &choices) { model.addDnsServers(anyAddress(choices), index); },
    [](auto &model, const auto &index, Choices &choices) { model.addNtpServers(anyAddress(choices), index); },
    [](auto &model, const auto &index, Choices &choices) {
        model.addDomainName(oneOf(choices, {"\"b.org\"", "\"c.org\"", "b.org"}), index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        const QStringList routes{QStringLiteral("24"), QStringLiteral("10,0,0,0"), anyAddress(choices)};
        model.addStaticRoutes(routes.mid(choices.below(4)), choices.below(2) == 0, index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        model.addBind9(anyWords(choices) + anyWords(choices) + anyWords(choices), index);
    },
    [](auto &model, const auto &index, Choices &choices) { model.replaceWords(index, anyWords(choices)); },
    [](auto &model, const auto &index, Choices &choices) {
        model.setData(index.siblingAtColumn(1), oneOf(choices, {"10.0.0.7", "10.0.0.7 10.0.0.9", "5", "10.2/16", ""}));
    },
    [](auto &model, const auto &index, Choices & /*choices*/) {
        if (index.parent().isValid())
            model.removeStatement(index);
    },
    [](auto &model, const auto &index, Choices &choices) {
        model.removeRows(choices.below(3), choices.below(3), index);
    },
};

// The tree as far as a file can hold it, where words are what blanks separate.
void appendWritable(QString &text, const DhcpdConfigStatement &statement, int depth)
{
    text += QString{depth, QLatin1Char{' '}} + statement.joinedWords().simplified();
    text += statement.isDeclaration() ? QLatin1String{" {\n"} : QLatin1String{"\n"};
    if (statement.isRange() || statement.isFixedAddress() || statement.isSubclass())
        return;
    for (int row{}; row < statement.childCount(); ++row)
        appendWritable(text, *statement.child(row), depth + 1);
}

QString writable(const DhcpdConfigModel &model)
{
    QString text;
    appendWritable(text, *model.statementFor({}), 0);
    return text;
}

// A comment sign in a word turns into a comment where quotes that were never closed come to stand in another order.
void verifyRoundTrip(const DhcpdConfigModel &model)
{
    const QByteArray written{model.fileContent()};
    if (written.contains('#'))
        return;
    const EditedModel read{TextEncoding{}.decode(written)}; // QString::fromUtf8() drops a byte order mark
    QCOMPARE(writable(read.model()), writable(model));
}

} // namespace

EditSequence::EditSequence(const QString &configuration)
    : m_edited{configuration}
{
    QObject::connect(&model(), &QAbstractItemModel::dataChanged, &model(), [this] { ++m_changes; });
    QObject::connect(&model(), &QAbstractItemModel::modelReset, &model(), [this] { ++m_resets; });
    QObject::connect(&model(), &DhcpdConfigModel::error, &model(), [this] { ++m_errors; });
}

int EditSequence::kinds() { return static_cast<int>(edits.size()); }

void EditSequence::edit(Choices &choices)
{
    const QVector<QModelIndex> indexes{indexesUnder(model(), {})};
    m_kind = choices.below(kinds());
    const QString before{m_edited.outline()};
    const bool wasModified{model().isModified()};
    m_changes = m_resets = m_errors = 0;

    edits[static_cast<std::size_t>(m_kind)](model(), indexes.at(choices.below(static_cast<int>(indexes.size()))),
                                            choices);

    QVERIFY(m_changes + m_errors <= 1);
    QVERIFY(m_resets <= m_changes);
    QCOMPARE(model().isModified(), wasModified || m_changes == 1);
    if (m_changes == 0)
        QCOMPARE(m_edited.outline(), before);
    verifyLinks(model());
    verifyRoundTrip(model());
    if (QTest::currentTestFailed())
        qWarning("edit of kind %d of:\n%s", m_kind, qPrintable(before));
}
