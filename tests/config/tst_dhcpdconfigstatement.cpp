// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/confignode.h"
#include "tests/support/text.h"

#include <QTest>

namespace {

using Kind = bool (DhcpdConfigStatement::*)() const;

struct KindRow
{
    const char *name;
    Kind isKind;
    const char *words;
};

constexpr KindRow kindRows[]{
    {"option", &DhcpdConfigStatement::isOption, "option"},
    {"hardware", &DhcpdConfigStatement::isHardware, "hardware"},
    {"MAC address", &DhcpdConfigStatement::isMacAddress, "hardware|ethernet"},
    {"key", &DhcpdConfigStatement::isKey, "key"},
    {"algorithm", &DhcpdConfigStatement::isAlgorithm, "algorithm"},
    {"secret", &DhcpdConfigStatement::isSecret, "secret"},
    {"primary", &DhcpdConfigStatement::isPrimary, "primary"},
    {"default lease time", &DhcpdConfigStatement::isDefaultLeaseTime, "default-lease-time"},
    {"max lease time", &DhcpdConfigStatement::isMaxLeaseTime, "max-lease-time"},
    {"routers", &DhcpdConfigStatement::isRouters, "option|routers"},
    {"DNS servers", &DhcpdConfigStatement::isDnsServers, "option|domain-name-servers"},
    {"NTP servers", &DhcpdConfigStatement::isNtpServers, "option|ntp-servers"},
    {"domain name", &DhcpdConfigStatement::isDomainName, "option|domain-name"},
    {"MS static route", &DhcpdConfigStatement::isMsStaticRoute, "option|ms-classless-static-routes"},
    {"static route", &DhcpdConfigStatement::isStaticRoute, "option|classless-static-routes"},
    {"subnet", &DhcpdConfigStatement::isSubnet, "subnet"},
    {"shared network", &DhcpdConfigStatement::isSharedNetwork, "shared-network"},
    {"host", &DhcpdConfigStatement::isHost, "host"},
    {"range", &DhcpdConfigStatement::isRange, "range"},
    {"fixed address", &DhcpdConfigStatement::isFixedAddress, "fixed-address"},
    {"subclass", &DhcpdConfigStatement::isSubclass, "subclass"},
    {"key declaration", &DhcpdConfigStatement::isKeyDeclaration, "key"},
    {"zone", &DhcpdConfigStatement::isZone, "zone"},
    {"group", &DhcpdConfigStatement::isGroup, "group"},
};

} // namespace

class DhcpdConfigStatementTest final : public QObject
{
    Q_OBJECT

private slots:
    void depthFollowsParents();
    void indentsByFourSpaces_data();
    void indentsByFourSpaces();
    void wordsOutOfRangeAreEmpty();
    void keepsAnyWord_data();
    void keepsAnyWord();
    void joinsWords_data();
    void joinsWords();
    void insertsWords_data();
    void insertsWords();
    void removesWords_data();
    void removesWords();
    void setsWord_data();
    void setsWord();
    void setsWordsFromAPosition_data();
    void setsWordsFromAPosition();
    void kindsIgnoreCase_data();
    void kindsIgnoreCase();
    void kindsCompareWholeWords_data();
    void kindsCompareWholeWords();
    void kindsFoldBeyondAscii();
    void leaseTimeIsAnyKeywordWithIt_data();
    void leaseTimeIsAnyKeywordWithIt();
    void childrenAreParametersFirst();
    void paramHasNoChildren();
    void removesChild();
    void removesStrangerToo();
    void removesChildren_data();
    void removesChildren();
    void paramShows_data();
    void paramShows();
    void declarationShows_data();
    void declarationShows();
    void furtherColumnsShowWords();
    void timesAreSplitIntoUnits_data();
    void timesAreSplitIntoUnits();
};

void DhcpdConfigStatementTest::depthFollowsParents()
{
    const auto top = makeTop();
    DhcpdConfigDeclaration allNetwork{split("All network|"), top.get()};
    DhcpdConfigDeclaration subnet{split("subnet|10.0.0.0"), &allNetwork};
    DhcpdConfigParam param{split("next-server|a"), &subnet};
    QCOMPARE(top->depth(), -2);
    QCOMPARE(allNetwork.depth(), -1);
    QCOMPARE(subnet.depth(), 0);
    QCOMPARE(param.depth(), 1);
    QVERIFY(top->isRoot());
    QVERIFY(allNetwork.isRoot());
    QVERIFY(!subnet.isRoot());
    QVERIFY(!param.isRoot());
    QCOMPARE(param.parent(), &subnet);

    param.setParent(&allNetwork);
    QCOMPARE(param.depth(), 0);
    QCOMPARE(param.parent(), &allNetwork);
    param.setParent(nullptr);
    QCOMPARE(param.depth(), -2);
    QVERIFY(param.isRoot());
    QCOMPARE(top->childCount() + allNetwork.childCount() + subnet.childCount(), 0);
}

void DhcpdConfigStatementTest::indentsByFourSpaces_data()
{
    QTest::addColumn<int>("ancestors");
    QTest::addColumn<QString>("indent");
    QTest::addRow("no parent") << 0 << QString{};
    QTest::addRow("all network") << 1 << QString{};
    QTest::addRow("top of the file") << 2 << QString{};
    QTest::addRow("in a block") << 3 << QStringLiteral("    ");
    QTest::addRow("in two blocks") << 4 << QStringLiteral("        ");
}

void DhcpdConfigStatementTest::indentsByFourSpaces()
{
    QFETCH(int, ancestors);
    std::vector<std::unique_ptr<DhcpdConfigDeclaration>> chain;
    for (int i{}; i < ancestors; ++i)
        chain.push_back(std::make_unique<DhcpdConfigDeclaration>(split("a|b"), i ? chain.back().get() : nullptr));
    const DhcpdConfigParam param{split("a|b"), ancestors ? chain.back().get() : nullptr};
    QTEST(param.indent(), "indent");
}

void DhcpdConfigStatementTest::wordsOutOfRangeAreEmpty()
{
    const DhcpdConfigParam param{split("a|b"), nullptr};
    QCOMPARE(param.wordCount(), 2);
    QCOMPARE(param.keyword(), QStringLiteral("a"));
    QCOMPARE(param.word(1), QStringLiteral("b"));
    for (const int index : {-1, std::numeric_limits<int>::min(), 2, std::numeric_limits<int>::max()})
        QCOMPARE(param.word(index), QString{});
    const DhcpdConfigParam empty{QStringList{}, nullptr};
    QCOMPARE(empty.wordCount(), 0);
    QCOMPARE(empty.keyword(), QString{});
}

void DhcpdConfigStatementTest::keepsAnyWord_data()
{
    QTest::addColumn<QString>("word");
    QTest::addRow("empty") << QString{};
    QTest::addRow("NUL") << QString{QChar{}};
    QTest::addRow("NUL inside") << QStringLiteral("a") + QChar{} + QStringLiteral("b");
    QTest::addRow("space") << QStringLiteral("a b");
    QTest::addRow("beyond ASCII") << QStringLiteral("Zürich");
    QTest::addRow("beyond the basic plane") << QString::fromUtf8("\xF0\x9F\x98\x80");
    QTest::addRow("byte order marks") << QString{3, QChar{QChar::ByteOrderMark}} + QStringLiteral("x");
    for (const int size : {34, 35, 36, 37, 253, 254, 255, 256, 257, 65535, 65536, 1000000})
        QTest::addRow("%d characters", size) << QString{size, QLatin1Char{'x'}};
}

void DhcpdConfigStatementTest::keepsAnyWord()
{
    QFETCH(QString, word);
    const QStringList words{QStringLiteral("first"), word, QStringLiteral("last")};
    DhcpdConfigParam param{words, nullptr};
    QCOMPARE(nodeOf(param).words, words);
    QVERIFY(param.setWord(1, QStringLiteral("other")));
    QVERIFY(param.setWord(0, word));
    QCOMPARE(nodeOf(param).words, (QStringList{word, QStringLiteral("other"), QStringLiteral("last")}));
    QVERIFY(param.setWord(0, QStringLiteral("short")));
    QCOMPARE(nodeOf(param).words, split("short|other|last"));
}

void DhcpdConfigStatementTest::joinsWords_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QString>("joined");
    QTest::addRow("none") << QStringList{} << QString{};
    QTest::addRow("one") << split("a") << QStringLiteral("a");
    QTest::addRow("several") << split("a|b|c") << QStringLiteral("a b c");
    QTest::addRow("last empty") << split("a|") << QStringLiteral("a ");
    QTest::addRow("first empty") << split("|a") << QStringLiteral(" a");
}

void DhcpdConfigStatementTest::joinsWords()
{
    QFETCH(QStringList, words);
    QTEST((DhcpdConfigDeclaration{words, nullptr}.joinedWords()), "joined");
}

void DhcpdConfigStatementTest::insertsWords_data()
{
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("count");
    QTest::addColumn<bool>("result");
    QTest::addColumn<QStringList>("words");
    QTest::addRow("at the start") << 0 << 1 << true << split("|a|b");
    QTest::addRow("between") << 1 << 2 << true << split("a|||b");
    QTest::addRow("at the end") << 2 << 1 << true << split("a|b|");
    QTest::addRow("none") << 2 << 0 << true << split("a|b");
    QTest::addRow("less than none") << 2 << -5 << true << split("a|b");
    QTest::addRow("before the start") << -1 << 1 << false << split("a|b");
    QTest::addRow("beyond the end") << 3 << 1 << false << split("a|b");
    QTest::addRow("none before the start") << -1 << 0 << false << split("a|b");
    QTest::addRow("none beyond the end") << 3 << 0 << false << split("a|b");
}

void DhcpdConfigStatementTest::insertsWords()
{
    QFETCH(int, position);
    QFETCH(int, count);
    DhcpdConfigDeclaration declaration{split("a|b"), nullptr};
    QTEST(declaration.insertWords(position, count), "result");
    QTEST(nodeOf(declaration).words, "words");
}

void DhcpdConfigStatementTest::removesWords_data()
{
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("count");
    QTest::addColumn<bool>("result");
    QTest::addColumn<QStringList>("words");
    QTest::addRow("at the start") << 0 << 1 << true << split("b|c");
    QTest::addRow("between") << 1 << 1 << true << split("a|c");
    QTest::addRow("to the end") << 1 << 2 << true << split("a");
    QTest::addRow("all") << 0 << 3 << true << QStringList{};
    QTest::addRow("none") << 1 << 0 << true << split("a|b|c");
    QTest::addRow("none at the end") << 3 << 0 << true << split("a|b|c");
    QTest::addRow("less than none") << 1 << -1 << true << split("a|b|c");
    QTest::addRow("before the start") << -1 << 1 << false << split("a|b|c");
    QTest::addRow("too many") << 2 << 2 << false << split("a|b|c");
    QTest::addRow("none beyond the end") << 4 << 0 << false << split("a|b|c");
    QTest::addRow("a number that overflows") << 2 << std::numeric_limits<int>::max() << false << split("a|b|c");
}

void DhcpdConfigStatementTest::removesWords()
{
    QFETCH(int, position);
    QFETCH(int, count);
    DhcpdConfigParam param{split("a|b|c"), nullptr};
    QTEST(param.removeWords(position, count), "result");
    QTEST(nodeOf(param).words, "words");
}

void DhcpdConfigStatementTest::setsWord_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<bool>("result");
    QTest::addColumn<QStringList>("words");
    QTest::addRow("first") << 0 << true << split("long new word|b");
    QTest::addRow("last") << 1 << true << split("a|long new word");
    QTest::addRow("before the first") << -1 << false << split("a|b");
    QTest::addRow("after the last") << 2 << false << split("a|b");
}

void DhcpdConfigStatementTest::setsWord()
{
    QFETCH(int, index);
    DhcpdConfigParam param{split("a|b"), nullptr};
    QTEST(param.setWord(index, QStringLiteral("long new word")), "result");
    QTEST(nodeOf(param).words, "words");
}

void DhcpdConfigStatementTest::setsWordsFromAPosition_data()
{
    QTest::addColumn<int>("position");
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<bool>("result");
    QTest::addColumn<QStringList>("after");
    QTest::addRow("all") << 0 << split("x|y") << true << split("x|y");
    QTest::addRow("some") << 1 << split("x|y|z") << true << split("a|x|y|z");
    QTest::addRow("at the end") << 2 << split("x") << true << split("a|b|x");
    QTest::addRow("by none") << 1 << QStringList{} << true << split("a");
    QTest::addRow("before the start") << -1 << split("x") << false << split("a|b");
    QTest::addRow("beyond the end") << 3 << split("x") << false << split("a|b");
}

void DhcpdConfigStatementTest::setsWordsFromAPosition()
{
    QFETCH(int, position);
    QFETCH(QStringList, words);
    DhcpdConfigParam param{split("a|b"), nullptr};
    QTEST(param.setWordsFrom(position, words), "result");
    QTEST(nodeOf(param).words, "after");
}

void DhcpdConfigStatementTest::kindsIgnoreCase_data()
{
    QTest::addColumn<int>("row");
    for (int row{}; row < static_cast<int>(std::size(kindRows)); ++row)
        QTest::addRow("%s", kindRows[row].name) << row;
}

void DhcpdConfigStatementTest::kindsIgnoreCase()
{
    QFETCH(int, row);
    const Kind isKind{kindRows[row].isKind};
    const QString words{QString::fromLatin1(kindRows[row].words)};
    QVERIFY((DhcpdConfigParam{words.split(QLatin1Char{'|'}), nullptr}.*isKind)());
    QVERIFY((DhcpdConfigDeclaration{words.toUpper().split(QLatin1Char{'|'}), nullptr}.*isKind)());
    QString mixed{words};
    mixed[0] = mixed[0].toUpper();
    QVERIFY((DhcpdConfigParam{mixed.split(QLatin1Char{'|'}), nullptr}.*isKind)());
}

void DhcpdConfigStatementTest::kindsCompareWholeWords_data() { kindsIgnoreCase_data(); }

void DhcpdConfigStatementTest::kindsCompareWholeWords()
{
    QFETCH(int, row);
    const Kind isKind{kindRows[row].isKind};
    const QString words{QString::fromLatin1(kindRows[row].words)};
    for (const QString &other : {words + QLatin1Char{'x'}, words.chopped(1), words + QChar{}, QString{}})
        QVERIFY2(!(DhcpdConfigParam{other.split(QLatin1Char{'|'}), nullptr}.*isKind)(), qPrintable(other));
    QVERIFY(!(DhcpdConfigParam{QStringList{}, nullptr}.*isKind)());
}

void DhcpdConfigStatementTest::kindsFoldBeyondAscii()
{
    // The long s and the Kelvin sign are case variants of s and k.
    QVERIFY((DhcpdConfigParam{{QString::fromUtf8("\u017Fubnet")}, nullptr}.isSubnet()));
    QVERIFY((DhcpdConfigParam{{QString::fromUtf8("\u212Aey")}, nullptr}.isKey()));
    QVERIFY((DhcpdConfigParam{{QString::fromUtf8("sha\u0072ed-networ\u212A")}, nullptr}.isSharedNetwork()));
    QVERIFY((!DhcpdConfigParam{{QString::fromUtf8("h\u00F6st")}, nullptr}.isHost()));
    QVERIFY((!DhcpdConfigParam{{QString::fromUtf8("host\u017F")}, nullptr}.isHost()));
}

void DhcpdConfigStatementTest::leaseTimeIsAnyKeywordWithIt_data()
{
    QTest::addColumn<QString>("keyword");
    QTest::addColumn<bool>("isLeaseTime");
    QTest::addRow("default") << QStringLiteral("default-lease-time") << true;
    QTest::addRow("max") << QStringLiteral("max-lease-time") << true;
    QTest::addRow("min") << QStringLiteral("min-lease-time") << true;
    QTest::addRow("capitals") << QStringLiteral("MIN-LEASE-TIME-X") << true;
    QTest::addRow("alone") << QStringLiteral("lease-time") << true;
    QTest::addRow("without hyphen") << QStringLiteral("leasetime") << false;
    QTest::addRow("none") << QString{} << false;
}

void DhcpdConfigStatementTest::leaseTimeIsAnyKeywordWithIt()
{
    QFETCH(QString, keyword);
    QTEST((DhcpdConfigParam{{keyword, QStringLiteral("600")}, nullptr}.isLeaseTime()), "isLeaseTime");
    QVERIFY((!DhcpdConfigParam{{QStringLiteral("x"), keyword}, nullptr}.isLeaseTime()));
}

void DhcpdConfigStatementTest::childrenAreParametersFirst()
{
    DhcpdConfigDeclaration parent{split("group|"), nullptr};
    QCOMPARE(parent.childCount(), 0);
    QCOMPARE(parent.child(0), nullptr);
    DhcpdConfigDeclaration *host{
        parent.addDeclaration(std::make_unique<DhcpdConfigDeclaration>(split("host|a"), &parent))};
    DhcpdConfigParam *first{parent.addParam(std::make_unique<DhcpdConfigParam>(split("p|1"), &parent))};
    DhcpdConfigDeclaration *zone{
        parent.addDeclaration(std::make_unique<DhcpdConfigDeclaration>(split("zone|b"), &parent))};
    DhcpdConfigParam *second{parent.addParam(std::make_unique<DhcpdConfigParam>(split("p|2"), &parent))};
    const std::vector<DhcpdConfigStatement *> rows{first, second, host, zone};
    QCOMPARE(parent.childCount(), 4);
    for (int row{}; row < 4; ++row) {
        QCOMPARE(parent.child(row), rows[static_cast<std::size_t>(row)]);
        QCOMPARE(parent.child(row)->row(), row);
    }
    QCOMPARE(parent.child(-1), nullptr);
    QCOMPARE(parent.child(4), nullptr);
    QCOMPARE(parent.row(), 0);
    QVERIFY(first->isParam() && !first->isDeclaration());
    QVERIFY(host->isDeclaration() && !host->isParam());
}

void DhcpdConfigStatementTest::paramHasNoChildren()
{
    DhcpdConfigParam param{split("a|b"), nullptr};
    QCOMPARE(param.childCount(), 0);
    QCOMPARE(param.child(0), nullptr);
    QVERIFY(!param.removeChildren(0, 0));
    DhcpdConfigParam other{split("c|d"), nullptr};
    param.removeChild(&other);
    QCOMPARE(other.keyword(), QStringLiteral("c"));
    QCOMPARE(param.row(), 0);
}

void DhcpdConfigStatementTest::removesChild()
{
    const ConfigNode node{split("group|"), {{split("p|1")}, {split("p|2")}}, {{split("d|1")}, {split("d|2")}}};
    DhcpdConfigDeclaration parent{node.words, nullptr};
    addChildren(parent, node);
    DhcpdConfigStatement *lastParam{parent.child(1)};
    DhcpdConfigStatement *lastDeclaration{parent.child(3)};
    parent.removeChild(parent.child(0));
    QCOMPARE(lastParam->row(), 0);
    QCOMPARE(lastDeclaration->row(), 2);
    parent.removeChild(parent.child(1));
    QCOMPARE(lastDeclaration->row(), 1);
    QCOMPARE(nodeOf(parent), (ConfigNode{split("group|"), {{split("p|2")}}, {{split("d|2")}}}));
    parent.removeChild(nullptr);
    QCOMPARE(parent.childCount(), 2);
}

void DhcpdConfigStatementTest::removesStrangerToo()
{
    // The leak checker sees whether it is destroyed.
    DhcpdConfigDeclaration parent{split("group|"), nullptr};
    parent.addParam(std::make_unique<DhcpdConfigParam>(split("p|1"), &parent));
    parent.removeChild(std::make_unique<DhcpdConfigParam>(split("p|1"), &parent).release());
    parent.removeChild(std::make_unique<DhcpdConfigDeclaration>(split("d|1"), nullptr).release());
    DhcpdConfigDeclaration childless{split("group|"), nullptr};
    childless.removeChild(std::make_unique<DhcpdConfigParam>(split("p|1"), nullptr).release());
    QCOMPARE(nodeOf(parent), (ConfigNode{split("group|"), {{split("p|1")}}, {}}));
    QCOMPARE(childless.childCount(), 0);
}

void DhcpdConfigStatementTest::removesChildren_data()
{
    QTest::addColumn<int>("row");
    QTest::addColumn<int>("count");
    QTest::addColumn<bool>("result");
    QTest::addColumn<QString>("left");
    QTest::addRow("all") << 0 << 5 << true << QString{};
    QTest::addRow("first parameter") << 0 << 1 << true << QStringLiteral("bxyz");
    QTest::addRow("all parameters") << 0 << 2 << true << QStringLiteral("xyz");
    QTest::addRow("across") << 1 << 2 << true << QStringLiteral("ayz");
    QTest::addRow("across, wide") << 1 << 3 << true << QStringLiteral("az");
    QTest::addRow("first declaration") << 2 << 1 << true << QStringLiteral("abyz");
    QTest::addRow("middle declaration") << 3 << 1 << true << QStringLiteral("abxz");
    QTest::addRow("last declaration") << 4 << 1 << true << QStringLiteral("abxy");
    QTest::addRow("none") << 2 << 0 << true << QStringLiteral("abxyz");
    QTest::addRow("none at the end") << 5 << 0 << true << QStringLiteral("abxyz");
    QTest::addRow("less than none") << 2 << -1 << true << QStringLiteral("abxyz");
    QTest::addRow("before the start") << -1 << 1 << false << QStringLiteral("abxyz");
    QTest::addRow("too many") << 3 << 3 << false << QStringLiteral("abxyz");
    QTest::addRow("beyond the end") << 6 << 0 << false << QStringLiteral("abxyz");
    QTest::addRow("overflow") << 1 << std::numeric_limits<int>::max() << false << QStringLiteral("abxyz");
}

void DhcpdConfigStatementTest::removesChildren()
{
    QFETCH(int, row);
    QFETCH(int, count);
    const ConfigNode node{split("group|"), {{split("a")}, {split("b")}}, {{split("x")}, {split("y")}, {split("z")}}};
    DhcpdConfigDeclaration parent{node.words, nullptr};
    addChildren(parent, node);
    QTEST(parent.removeChildren(row, count), "result");
    QString left;
    for (int i{}; i < parent.childCount(); ++i) {
        QCOMPARE(parent.child(i)->row(), i);
        left += parent.child(i)->keyword();
    }
    QTEST(left, "left");
}

void DhcpdConfigStatementTest::paramShows_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QString>("label");
    QTest::addColumn<QString>("value");
    const struct
    {
        const char *words;
        const char *label;
        const char *value;
    } rows[]{
        {"option|routers|10.0.0.1,|10.0.0.2", "Gateways", "10.0.0.1, 10.0.0.2"},
        {"option|domain-name-servers|10.0.0.1", "DNS servers", "10.0.0.1"},
        {"option|domain-name|\"example.org\"", "Domain name", "\"example.org\""},
        {"option|ntp-servers|10.0.0.1", "NTP servers", "10.0.0.1"},
        {"option|ms-classless-static-routes|8,|10", "Static route MS", "8, 10"},
        {"option|classless-static-routes|8,|10", "Static route", "8, 10"},
        {"OPTION|Routers|10.0.0.1", "Gateways", "10.0.0.1"},
        {"option|host-name|\"a|b\"", "host-name", "\"a b\""},
        {"option|", "", ""},
        {"option", "", "option"},
        {"option|routers", "Gateways", "routers"},
        {"hardware|ethernet|00:11:22:33:44:55", "MAC address", "00:11:22:33:44:55"},
        {"HARDWARE|Ethernet|00:11", "MAC address", "00:11"},
        {"hardware|ethernet", "MAC address", "ethernet"},
        {"hardware|token-ring|00:11", "hardware", "token-ring 00:11"},
        {"max-lease-time|7200", "Max lease time", "2 hours "},
        {"default-lease-time|60", "Default lease time", "1 minutes "},
        {"min-lease-time|60", "min-lease-time", "1 minutes "},
        {"key|a", "Key", "a"},
        {"algorithm|hmac-md5", "Key generation algorithm", "hmac-md5"},
        {"secret|\"x\"", "Generated secret", "\"x\""},
        {"primary|127.0.0.1", "Master DNS Server", "127.0.0.1"},
        {"authoritative|", "authoritative", ""},
        {"authoritative", "authoritative", "authoritative"},
        {"filename|\"my|boot|file\"", "filename", "\"my boot file\""},
        {"routers|10.0.0.1", "routers", "10.0.0.1"},
        {"subnet|10.0.0.0", "subnet", "10.0.0.0"},
    };
    for (const auto &row : rows) {
        QTest::addRow("%s", row.words) << split(row.words) << QString::fromLatin1(row.label)
                                       << QString::fromLatin1(row.value);
    }
    QTest::addRow("no words") << QStringList{} << QString{} << QString{};
}

void DhcpdConfigStatementTest::paramShows()
{
    QFETCH(QStringList, words);
    const DhcpdConfigParam param{words, nullptr};
    QTEST(param.label(), "label");
    QTEST(param.valueText(), "value");
    QTEST(param.text(0), "label");
    QTEST(param.text(1), "value");
}

void DhcpdConfigStatementTest::declarationShows_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QString>("label");
    QTest::addColumn<QString>("value");
    const struct
    {
        const char *words;
        const char *label;
        const char *value;
    } rows[]{
        {"subnet|10.0.0.0|netmask|255.0.0.0", "Subnet", "10.0.0.0 / 255.0.0.0"},
        {"SUBNET|10.0.0.0|netmask|255.0.0.0", "Subnet", "10.0.0.0 / 255.0.0.0"},
        {"subnet|10.0.0.0", "Subnet", "10.0.0.0 / "},
        {"subnet", "Subnet", " / "},
        {"shared-network|office", "Shared network", "office"},
        {"host|a", "Host", "a"},
        {"host|\"my|pc\"", "Host", "\"my pc\""},
        {"range|10.0.0.1|10.0.0.9", "Range", "10.0.0.1 - 10.0.0.9"},
        {"range|10.0.0.1", "Range", "10.0.0.1 - "},
        {"fixed-address|10.0.0.1", "Fixed address", "10.0.0.1"},
        {"key|a", "Key information", "a"},
        {"zone|a.", "Zone served by DNS server", "a."},
        {"group|", "Group", ""},
        {"group", "Group", "group"},
        {"subclass|\"a\"|b", "subclass", "\"a\" b"},
        {"All network|", "All network", ""},
        {"option|routers|10.0.0.1", "option", "routers 10.0.0.1"},
        {"max-lease-time|60", "max-lease-time", "60"},
    };
    for (const auto &row : rows) {
        QTest::addRow("%s", row.words) << split(row.words) << QString::fromLatin1(row.label)
                                       << QString::fromLatin1(row.value);
    }
    QTest::addRow("no words") << QStringList{} << QString{} << QString{};
}

void DhcpdConfigStatementTest::declarationShows()
{
    QFETCH(QStringList, words);
    const DhcpdConfigDeclaration declaration{words, nullptr};
    QTEST(declaration.label(), "label");
    QTEST(declaration.valueText(), "value");
    QTEST(declaration.text(0), "label");
    QTEST(declaration.text(1), "value");
}

void DhcpdConfigStatementTest::furtherColumnsShowWords()
{
    const QStringList words{split("subnet|10.0.0.0|netmask|255.0.0.0")};
    const DhcpdConfigDeclaration declaration{words, nullptr};
    const DhcpdConfigParam param{words, nullptr};
    for (const DhcpdConfigStatement *statement :
         std::initializer_list<const DhcpdConfigStatement *>{&declaration, &param}) {
        QCOMPARE(statement->text(2), QStringLiteral("netmask"));
        QCOMPARE(statement->text(3), QStringLiteral("255.0.0.0"));
        QCOMPARE(statement->text(4), QString{});
        QCOMPARE(statement->text(-1), QString{});
    }
}

void DhcpdConfigStatementTest::timesAreSplitIntoUnits_data()
{
    QTest::addColumn<QString>("seconds");
    QTest::addColumn<QString>("text");
    QTest::addRow("zero") << QStringLiteral("0") << QString{};
    QTest::addRow("no number") << QStringLiteral("abc") << QString{};
    QTest::addRow("number and unit") << QStringLiteral("600s") << QString{};
    QTest::addRow("negative") << QStringLiteral("-90061") << QString{};
    QTest::addRow("one second") << QStringLiteral("1") << QStringLiteral("1 seconds ");
    QTest::addRow("one month") << QStringLiteral("2592000") << QStringLiteral("1 mounth ");
    QTest::addRow("one of each but months")
        << QStringLiteral("90061") << QStringLiteral("1 days 1 hours 1 minutes 1 seconds ");
    QTest::addRow("two hours") << QStringLiteral("7200") << QStringLiteral("2 hours ");
    QTest::addRow("one before a month") << QStringLiteral("2591999")
                                        << QStringLiteral("29 days 23 hours 59 minutes 59 seconds ");
    QTest::addRow("the server's infinity")
        << QStringLiteral("4294967295") << QStringLiteral("1657 mounth 6 hours 28 minutes 15 seconds ");
}

void DhcpdConfigStatementTest::timesAreSplitIntoUnits()
{
    QFETCH(QString, seconds);
    QTEST((DhcpdConfigParam{{QStringLiteral("max-lease-time"), seconds}, nullptr}.valueText()), "text");
}

QTEST_GUILESS_MAIN(DhcpdConfigStatementTest)
#include "tst_dhcpdconfigstatement.moc"
