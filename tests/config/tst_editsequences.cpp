// SPDX-License-Identifier: GPL-3.0-or-later
// What holds after any sequence of edits.
#include "tests/config/editedmodel.h"

#include <QRandomGenerator>
#include <QTest>

namespace {

constexpr int sequences{10'000};
constexpr int editsOfSequence{5};

constexpr auto base = R"(option domain-name "a.org";
subnet 10.0.0.0 netmask 255.255.255.0 { range 10.0.0.10 10.0.0.20; option routers 10.0.0.1; }
shared-network office { subnet 10.1.0.0 netmask 255.255.0.0 { pool { range 10.1.0.1 10.1.0.2; } } }
group { host a { hardware ethernet 00:11:22:33:44:55; fixed-address 10.0.0.5; } }
subclass "x" y;
classless-static-routes a;
)";

using Random = QRandomGenerator;

QString oneOf(Random &random, std::initializer_list<const char *> texts)
{
    return QString::fromUtf8(*(texts.begin() + random.bounded(static_cast<int>(texts.size()))));
}

QString anyAddress(Random &random)
{
    return oneOf(random, {"10.0.0.7", "10.0.0.9", "10.1.0.3", "0.0.0.0", "127.0.0.1", "", "x"});
}

QStringList anyWords(Random &random)
{
    QStringList words{oneOf(random, {"pool", "group", "host", "subnet", "shared-network", "option", "x", "Key"})};
    for (int count{random.bounded(4)}; count > 0; --count)
        words += oneOf(random, {"a", "10.0.0.0", "netmask", "255.0.0.0", "domain-name", "routers", "\"q\""});
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

const std::function<void(DhcpdConfigModel &, const QModelIndex &, Random &)> edits[]{
    [](auto &model, const auto &index, Random &random) {
        model.addSharedNetwork(oneOf(random, {"a", "b", ""}), index);
    },
    [](auto &model, const auto &index, Random &random) {
        model.addSubnet(anyAddress(random), oneOf(random, {"24", "255.255.0.0", "33", ""}), index);
    },
    [](auto &model, const auto &index, Random &random) {
        model.addRange(oneOf(random, {"10.0.0.7", "10.1.0.7"}), oneOf(random, {"10.0.0.9", "10.1.0.9", "x"}), index);
    },
    [](auto &model, const auto &index, Random &random) {
        model.addHost(oneOf(random, {"a", "b c", ""}), oneOf(random, {"00:11:22:33:44:55", "zz", ""}),
                      anyAddress(random), index);
    },
    [](auto &model, const auto &index, Random &random) { model.addFixedAddress(anyAddress(random), index); },
    [](auto &model, const auto &index, Random &random) { model.addDeclaration(anyWords(random), index); },
    [](auto &model, const auto &index, Random &random) { model.addParameter(anyWords(random), index); },
    [](auto &model, const auto &index, Random &random) {
        model.addDefaultLeaseTime(oneOf(random, {"600", "0", "7"}), index);
    },
    [](auto &model, const auto &index, Random &random) {
        model.addMaxLeaseTime(oneOf(random, {"600", "0"}), index);
    },
    [](auto &model, const auto &index, Random &random) { model.addRouters(anyAddress(random), index); },
    [](auto &model, const auto &index, Random &random) { model.addDnsServers(anyAddress(random), index); },
    [](auto &model, const auto &index, Random &random) { model.addNtpServers(anyAddress(random), index); },
    [](auto &model, const auto &index, Random &random) {
        model.addDomainName(oneOf(random, {"\"b.org\"", "\"c.org\"", "b.org"}), index);
    },
    [](auto &model, const auto &index, Random &random) {
        const QStringList routes{QStringLiteral("24"), QStringLiteral("10,0,0,0"), anyAddress(random)};
        model.addStaticRoutes(routes.mid(random.bounded(4)), random.bounded(2) == 0, index);
    },
    [](auto &model, const auto &index, Random &random) {
        model.addBind9(anyWords(random) + anyWords(random) + anyWords(random), index);
    },
    [](auto &model, const auto &index, Random &random) { model.replaceWords(index, anyWords(random)); },
    [](auto &model, const auto &index, Random &random) {
        model.setData(index.siblingAtColumn(1), oneOf(random, {"10.0.0.7", "10.0.0.7 10.0.0.9", "5", "10.2/16", ""}));
    },
    [](auto &model, const auto &index, Random & /*random*/) {
        if (index.parent().isValid())
            model.removeStatement(index);
    },
    [](auto &model, const auto &index, Random &random) {
        model.removeRows(random.bounded(3), random.bounded(3), index);
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

void verifyRoundTrip(const DhcpdConfigModel &model)
{
    const EditedModel read{QString::fromUtf8(model.fileContent())};
    QCOMPARE(writable(read.model()), writable(model));
}

} // namespace

class EditSequencesTest final : public QObject
{
    Q_OBJECT

private slots:
    void keepsTheTreeWhole();
};

void EditSequencesTest::keepsTheTreeWhole()
{
    Random random{20240607};
    std::vector<int> changesOfEdit(std::size(edits));
    std::vector<int> refusalsOfEdit(std::size(edits));
    for (int sequence{}; sequence < sequences; ++sequence) {
        EditedModel edited{QString::fromUtf8(base)};
        DhcpdConfigModel &model{edited.model()};
        int changes{};
        int resets{};
        int errors{};
        connect(&model, &QAbstractItemModel::dataChanged, this, [&changes] { ++changes; });
        connect(&model, &QAbstractItemModel::modelReset, this, [&resets] { ++resets; });
        connect(&model, &DhcpdConfigModel::error, this, [&errors] { ++errors; });

        for (int i{}; i < editsOfSequence; ++i) {
            const QVector<QModelIndex> indexes{indexesUnder(model, {})};
            const quint32 edit{random.bounded(static_cast<quint32>(std::size(edits)))};
            const QString before{edited.outline()};
            const bool wasModified{model.isModified()};
            changes = resets = errors = 0;

            edits[edit](model, indexes.at(random.bounded(indexes.size())), random);

            QVERIFY(changes + errors <= 1);
            QVERIFY(resets <= changes);
            QCOMPARE(model.isModified(), wasModified || changes == 1);
            if (changes == 0)
                QCOMPARE(edited.outline(), before);
            changesOfEdit[edit] += changes;
            refusalsOfEdit[edit] += errors;
            verifyLinks(model);
            verifyRoundTrip(model);
            if (QTest::currentTestFailed()) {
                qWarning("sequence %d, edit %d of kind %u of:\n%s", sequence, i, edit, qPrintable(before));
                return;
            }
        }
    }
    // An edit that was never made, or never refused, proves nothing. Replacing words and removing are never refused.
    for (std::size_t edit{}; edit < std::size(edits); ++edit) {
        const bool canRefuse{edit < 15 || edit == 16};
        QVERIFY2(changesOfEdit[edit] > 20 && (refusalsOfEdit[edit] > 100 || !canRefuse),
                 qPrintable(QStringLiteral("edit %1: %2 changes").arg(edit).arg(changesOfEdit[edit])));
    }
}

QTEST_GUILESS_MAIN(EditSequencesTest)
#include "tst_editsequences.moc"
