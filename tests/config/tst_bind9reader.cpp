// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/bind9reader.h"
#include "config/bind9words.h"
#include "config/dhcpdconfigmodel.h"
#include "config/values.h"
#include "tests/support/realdhcpd.h"
#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QTest>

#include <algorithm>
#include <iterator>

namespace {

// The words between the bars of a text; none for an empty text.
QStringList words(const char *text)
{
    const QString joined{QString::fromUtf8(text)};
    return joined.isEmpty() ? QStringList{} : joined.split(QLatin1Char{'|'});
}

constexpr auto keyAndTwoZones = R"(// The keys and zones of this server.
key "ddns-key" {
    algorithm hmac-sha256;
    secret "Zm9v/YmFyYmF6+w==";
};
zone "example.org" IN {
    type master;
    file "/var/lib/bind/db.example.org";
    allow-update { key "ddns-key"; };
};
zone "1.168.192.in-addr.arpa" {
    type master;
    file "/var/lib/bind/db.192.168.1";
    allow-update { key "ddns-key"; };
};
)";

constexpr auto keyAndTwoZonesStatements = R"(key|"ddns-key"|algorithm|hmac-sha256|secret|"Zm9v/YmFyYmF6+w==")"
                                          R"(|zone|example.org.|primary|127.0.0.1|key|"ddns-key")"
                                          R"(|zone|1.168.192.in-addr.arpa.|primary|127.0.0.1|key|"ddns-key")";

// Each zone that was left out with the reason and its key.
QStringList described(const QVector<bind9::LeftOutZone> &zones)
{
    static const QStringList reasons{words("not primary|no key|refused name|unknown key|refused key|key behind")};
    QStringList texts;
    for (const bind9::LeftOutZone &zone : zones) {
        texts +=
            QStringLiteral("%1: %2 %3").arg(zone.name, reasons.at(static_cast<int>(zone.reason)), zone.key).trimmed();
    }
    return texts;
}

// The configuration of a server to which the zones and keys of a bind9 configuration were added.
QByteArray configurationWith(const QStringList &statements, const QString &before = {})
{
    DhcpdConfigModel model{{QString{}, QString{}}};
    model.parse(before);
    if (!statements.isEmpty())
        model.addBind9(statements, model.index(0, 0));
    return model.fileContent();
}

QStringList preparedFrom(const QTemporaryDir &folder, const char *file, const QStringList &knownKeys = {})
{
    return bind9::prepared(folder.filePath(QString::fromUtf8(file)), knownKeys).statements;
}

} // namespace

class Bind9ReaderTest final : public QObject
{
    Q_OBJECT

private slots:
    void scansStatements_data();
    void scansStatements();
    void removesComments_data();
    void removesComments();
    void keepsZonesAndKeys_data();
    void keepsZonesAndKeys();
    void choosesUsable_data();
    void choosesUsable();
    void preparesFile_data();
    void preparesFile();
    void followsIncludes_data();
    void followsIncludes();
    void limitsDepthOfIncludes();
    void limitsSizeOfIncludes();
    void limitsNumberOfFiles();
    void comesToAnEndWhereFilesIncludeEachOther();
    void givesNothingForUnreadableFile();
    void survivesAnyText();
    void tellsWhatIsLeftOut_data();
    void tellsWhatIsLeftOut();
    void leavesOutWhatTheServerRefuses_data();
    void leavesOutWhatTheServerRefuses();
    void givesTheServerNothingThatItRefuses();
};

void Bind9ReaderTest::scansStatements_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QStringList>("expected");

    const auto row = [](const char *name, const char *text, const char *expected) {
        QTest::addRow("%s", name) << QString::fromUtf8(text) << words(expected);
    };
    row("usual file", keyAndTwoZones, keyAndTwoZonesStatements);
    row("empty", "", "");
    row("comments only", "// one\n/* two */\n// three", "");
    row("dropped statements only", "type master; file \"f\"; allow-update { };", "");
    row("zone without updaters", "zone \"a.org\" { type master; };", "zone|a.org.|primary|127.0.0.1");
    row("zone without quotes", "zone a.org {", "zone|a.org.|primary|127.0.0.1");
    row("zone without block", "zone \"a.org\";", "zone|a.org.");
    row("zone as second word", "in-view zone;", "in-view|zone.");
    row("zone alone", "zone;", "zone|.");
    row("zone before closing brace", "zone \"a.org\" }", "zone|a.org.");
    row("zone in capitals", "ZONE \"a.org\" {", "ZONE|\"a.org\"");
    row("class", "zone \"a.org\" IN {", "zone|a.org.|primary|127.0.0.1");
    row("class in lower case", "zone \"a.org\" in {", "zone|a.org.|in|primary|127.0.0.1");
    row("class as second word", "zone IN {", "zone|IN.|primary|127.0.0.1");
    row("third word goes wherever the class stands", "IN a b c;", "IN|a");
    row("one word", "options { recursion; };", "options||recursion|");
    row("three words", "grant k zonesub;", "grant|k|zonesub");
    row("include", "include \"/etc/bind/k\";", "include|\"/etc/bind/k\"");
    row("dropped before semicolon", "type master;", "");
    row("dropped before opening brace", "file {", "");
    row("dropped before closing brace", "type master }", "type|master");
    row("dropped as second word", "a type;", "");
    row("dropped in capitals", "TYPE master;", "TYPE|master");
    row("hash", "# a;", "#|a");
    row("one slash", "a / b;\nc;", "a|c");
    row("slash within a word", "a b/c;\nd;", "a|b|d");
    row("slash between quotes", "a \"b/c\";", "a|\"b/c\"");
    row("blank between quotes", "a \"b c\";", "a|\"b|c\"");
    row("delimiter between quotes", "a \"b;c\";", "a|\"b|c\"|");
    row("comment at the end", "a b; //", "a|b");
    row("word at the end", "a b; c", "a|b");
    row("statement at the end", "a b; c ", "a|b");
    row("unbalanced quote", "a \"b; c / d;", "a|\"b|c|/|d");
    row("carriage return", "a b;\r\nc d;", "a|b|\r|c|d");
}

void Bind9ReaderTest::scansStatements()
{
    QFETCH(QString, text);
    QFETCH(QStringList, expected);
    QCOMPARE(bind9::statements(text), expected);
}

void Bind9ReaderTest::removesComments_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("expected");

    const auto row = [](const char *name, const char *text, const char *expected) {
        QTest::addRow("%s", name) << QString::fromUtf8(text) << QString::fromUtf8(expected);
    };
    row("none", "a \"b\"; / * c", "a \"b\"; / * c");
    row("slashes", "a; // b\nc;", "a;  \nc;");
    row("hash", "a; # b\nc;", "a;  \nc;");
    row("hash within a word", "a#b\nc", "a \nc");
    row("block", "a /* b\nc */ d", "a   d");
    row("block between words", "zone/**/\"a\"", "zone \"a\"");
    row("slash that ends no block", "/*/ a */b", " b");
    row("line comment within block", "/* // */ a", "  a");
    row("block within line comment", "// /*\na */", " \na */");
    row("between quotes", "\"// # /* */\" a", "\"// # /* */\" a");
    row("quote within comment", "// \"\na // b\n", " \na  \n");
    row("line comment to the end", "a // b", "a  ");
    row("hash to the end", "a #", "a  ");
    row("block to the end", "a /* b", "a  ");
    row("slash at the end", "a /", "a /");
    row("escaped quote", R"("a\"b // c" d // e)", R"("a\"b // c" d  )");
    row("escaped backslash", R"("a\\" // "b)", R"("a\\"  )");
    row("backslash outside quotes", R"(a \" // " b)", R"(a \" // " b)");
    row("empty", "", "");
}

void Bind9ReaderTest::removesComments()
{
    QFETCH(QString, text);
    QFETCH(QString, expected);
    QCOMPARE(bind9::withoutComments(text), expected);
}

void Bind9ReaderTest::keepsZonesAndKeys_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QStringList>("expected"); // as statements

    const auto row = [](const char *name, const char *text, const char *expected) {
        QTest::addRow("%s", name) << QString::fromUtf8(text) << words(expected);
    };
    row("options", "options { directory \"/var/cache/bind\"; listen-on { any; }; };", "");
    row("controls", "controls { inet 127.0.0.1 port 953 allow { 127.0.0.1; } keys { \"rndc-key\"; }; };", "");
    row("view", "view \"inside\" { match-clients { any; }; zone a { allow-update { key k; }; }; recursion no; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("key in a view", "view v { key k { algorithm a; secret s; }; };", "key|k|algorithm|a|secret|s");
    row("class of any case", "zone a in { }; zone b In { }; zone c IN { };",
        "zone|a.|primary|127.0.0.1|zone|b.|primary|127.0.0.1|zone|c.|primary|127.0.0.1");
    row("keywords of any case", "ZONE a { Allow-Update { KEY k; }; }; Key k { Algorithm a; SECRET s; };",
        "zone|a.|primary|127.0.0.1|key|k|key|k|algorithm|a|secret|s");
    row("dot at the end", "zone \"a.org.\" { };", "zone|a.org.|primary|127.0.0.1");
    row("root zone", "zone \".\" { type hint; allow-update { key k; }; };", "");
    row("heading without a name", "zone { allow-update { key k; }; }; key { algorithm a; };", "");
    row("keys of other purposes",
        "zone a { masters { 10.0.0.1 key m; }; allow-transfer { key t; }; allow-update { key u; }; };",
        "zone|a.|primary|127.0.0.1|key|u");
    row("several keys", "zone a { allow-update { 10.0.0.1; !key x; key k; key l; }; };",
        "zone|a.|primary|127.0.0.1|key|k|key|l");
    row("denied list", "zone a { allow-update { !{ !10.0.0.0/8; key x; }; key k; }; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("update policy", "zone a { update-policy { deny d name a.; grant k zonesub ANY; grant l self l; }; };",
        "zone|a.|primary|127.0.0.1|key|k|key|l");
    row("update policy without a block", "zone a { update-policy local; };", "zone|a.|primary|127.0.0.1");
    row("updaters outside a zone", "options { allow-update { key k; }; }; allow-update { key k; };", "");
    row("slash in a word without quotes", "key k { algorithm a; secret YS9i/Yw==; };",
        "key|k|algorithm|a|secret|\"YS9i/Yw==\"");
    row("zone named like a keyword",
        R"(zone file { allow-update { key k; }; }; zone "type" { }; zone zone { }; zone "allow-update." IN { };)",
        "zone|file.|primary|127.0.0.1|key|k|zone|type.|primary|127.0.0.1|zone|zone.|primary|127.0.0.1"
        "|zone|allow-update.|primary|127.0.0.1");
    row("key named like a keyword",
        R"(zone a { allow-update { key file; key "type"; key zone; }; update-policy { grant allow-update self b; }; };)"
        R"(key file { algorithm a; secret s; }; key zone { algorithm type; secret "s"; };)",
        R"(zone|a.|primary|127.0.0.1|key|"file"|key|"type"|key|"zone"|key|"allow-update")"
        R"(|key|"file"|algorithm|a|secret|s|key|"zone"|algorithm|"type"|secret|"s")");
    row("delimiters between quotes", "options { version \"zone a { allow-update { key k; }; };\"; };", "");
    row("name with a blank", R"(zone "a b" { allow-update { key k; }; }; key "c;d" { algorithm a; secret s; };)", "");
    row("carriage returns", "zone a {\r\nallow-update {\r\nkey k;\r\n};\r\n};\r\n", "zone|a.|primary|127.0.0.1|key|k");
    row("surplus closing braces", "}; } key k { algorithm a; secret s; }; }", "key|k|algorithm|a|secret|s");
    row("blocks left open", "zone a { allow-update { key k; ", "zone|a.|primary|127.0.0.1|key|k");
    row("words before a closing brace", "key k { algorithm a; secret s }", "key|k|algorithm|a");
    row("unbalanced quote", "zone \"a { allow-update { key k; }; };", "");
    row("escaped quote", R"(options { version "\"; zone x { allow-update { key k; }; }; \\"; }; zone a { };)",
        "zone|a.|primary|127.0.0.1");
    row("list with a name", "acl \"us\" { 10.0.0.1; key k; !key x; }; zone a { allow-update { us; }; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("list with a name in other quotes and case, behind the zone",
        R"(zone a { allow-update { "Us"; key l; }; }; ACL us { key k; };)", "zone|a.|primary|127.0.0.1|key|k|key|l");
    row("list within a list", "acl a { b; { key k; }; }; acl b { key l; }; zone a { allow-update { a; }; };",
        "zone|a.|primary|127.0.0.1|key|l|key|k");
    row("lists in a circle", "acl a { b; key k; }; acl b { a; key l; }; zone a { allow-update { a; }; };",
        "zone|a.|primary|127.0.0.1|key|l|key|k");
    row("denied list with a name", "acl us { key x; }; zone a { allow-update { !us; key k; }; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("no list of that name", "acl us { key x; }; zone a { allow-update { them; any; key k; }; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("updaters of the options", "zone a { type master; }; options { allow-update { key k; }; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("updaters of a view",
        "options { allow-update { key o; }; }; view v { zone a { type primary; }; allow-update { key v; }; };"
        "view w { zone b { type primary; }; }; zone c { type primary; };",
        "zone|a.|primary|127.0.0.1|key|v|zone|b.|primary|127.0.0.1|key|o|zone|c.|primary|127.0.0.1|key|o");
    row("updaters of the zone itself before those of the options",
        "options { allow-update { key o; }; }; zone a { type master; allow-update { none; }; };"
        "zone b { type master; update-policy local; }; zone c { type master; update-policy { grant g zonesub; }; };",
        "zone|a.|primary|127.0.0.1|zone|b.|primary|127.0.0.1|zone|c.|primary|127.0.0.1|key|g");
    row("updaters of the options by a list with a name",
        "acl us { key k; }; options { allow-update { us; }; }; zone a { type master; };",
        "zone|a.|primary|127.0.0.1|key|k");
    row("copies of zones have no updaters of the options",
        "options { allow-update { key o; }; }; zone a { type slave; }; zone b { type hint; }; view v { zone c { "
        "in-view w; "
        "}; };",
        "zone|a.|primary|127.0.0.1|zone|b.|primary|127.0.0.1|zone|c.|primary|127.0.0.1");
}

void Bind9ReaderTest::keepsZonesAndKeys()
{
    QFETCH(QString, text);
    QFETCH(QStringList, expected);
    QCOMPARE(bind9::statements(bind9::zonesAndKeys(text)), expected);
}

void Bind9ReaderTest::choosesUsable_data()
{
    QTest::addColumn<QStringList>("statements");
    QTest::addColumn<QStringList>("knownKeys");
    QTest::addColumn<QStringList>("expected");

    const auto row = [](const char *name, const char *statements, const char *knownKeys, const char *expected) {
        QTest::addRow("%s", name) << words(statements) << words(knownKeys) << words(expected);
    };
    const auto sameRow = [&row](const char *name, const char *statements, const char *knownKeys = "") {
        row(name, statements, knownKeys, statements);
    };
    sameRow("nothing", "");
    sameRow("usual", keyAndTwoZonesStatements);
    sameRow("order that the server takes", "key|k|algorithm|a|secret|s|zone|a.|primary|127.0.0.1|key|k"
                                           "|key|l|secret|s|algorithm|a|zone|b.|primary|127.0.0.1|key|l");
    sameRow("key without a zone", "key|k|algorithm|a|secret|s");
    row("zone before its key", "zone|a.|primary|127.0.0.1|key|k|key|o|algorithm|a|secret|s|key|k|algorithm|a|secret|s",
        "", "key|k|algorithm|a|secret|s|zone|a.|primary|127.0.0.1|key|k|key|o|algorithm|a|secret|s");
    row("key given twice", "key|k|algorithm|a|secret|s|key|\"K\"|algorithm|a|secret|s", "",
        "key|\"K\"|algorithm|a|secret|s");
    row("algorithm in quotes", R"(key|k|algorithm|"hmac-md5"|secret|"s")", "", "key|k|algorithm|hmac-md5|secret|\"s\"");
    row("algorithm in quotes behind the secret", R"(key|k|secret|"s"|algorithm|"hmac-md5")", "",
        "key|k|secret|\"s\"|algorithm|hmac-md5");
    row("zone without a key", "zone|a.|primary|127.0.0.1|zone|b.|primary|127.0.0.1|key|k|key|k|algorithm|a|secret|s",
        "", "key|k|algorithm|a|secret|s|zone|b.|primary|127.0.0.1|key|k");
    row("unknown key", "zone|a.|primary|127.0.0.1|key|k", "l|m", "");
    sameRow("key of the configuration", "zone|a.|primary|127.0.0.1|key|\"K\"", "l|k");
    row("key of the configuration in other quotes and case", "zone|a.|primary|127.0.0.1|key|k", "\"K\"",
        "zone|a.|primary|127.0.0.1|key|k");
    row("dot at the end of the known name only", "zone|a.|primary|127.0.0.1|key|\"k\"", "k.",
        "zone|a.|primary|127.0.0.1|key|k.");
    row("dot at the end of the reference only", "key|\"k\"|algorithm|a|secret|s|zone|a.|primary|127.0.0.1|key|k.", "",
        R"(key|"k"|algorithm|a|secret|s|zone|a.|primary|127.0.0.1|key|"k")");
    row("first key that there is", "zone|a.|primary|127.0.0.1|key|x|key|l|key|k", "k|l",
        "zone|a.|primary|127.0.0.1|key|l");
    row("key without a secret", "key|k|algorithm|a|zone|a.|primary|127.0.0.1|key|k", "", "");
    row("key with an empty secret", "key|k|algorithm|a|secret|", "", "");
    row("key without an algorithm", "key|k|secret|s|secret|s", "", "");
    row("last key cut short", "key|k|algorithm|a|secret", "", "");
    row("last zone cut short", "zone|a.|primary|127.0.0.1|key", "k", "");
    row("other statements between",
        "options||directory|\"d\"|a|b|c|key|k|algorithm|a|secret|s|recursion||zone|a.|primary|127.0.0.1|key|k|x", "",
        "key|k|algorithm|a|secret|s|zone|a.|primary|127.0.0.1|key|k");
}

void Bind9ReaderTest::choosesUsable()
{
    QFETCH(QStringList, statements);
    QFETCH(QStringList, knownKeys);
    QFETCH(QStringList, expected);
    QCOMPARE(bind9::usable(statements, knownKeys), expected);
}

void Bind9ReaderTest::preparesFile_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QStringList>("expected");

    const auto row = [](const char *name, const QByteArray &content, const char *expected) {
        QTest::addRow("%s", name) << content << words(expected);
    };
    row("usual", keyAndTwoZones, keyAndTwoZonesStatements);
    row("empty", "", "");
    row("comments only", "// one\n# two\n/* three */", "");
    row("type, file and allow-update only", "type master; file \"f\"; allow-update { none; };", "");
    row("nobody may update", "zone a { type master; }; zone b { allow-update { none; }; }; zone c { type slave; };",
        "");
    row("comments of every style",
        "# zone x {\nkey k { // {\n algorithm \"hmac-md5\"; /* }; \n*/ secret \"YQ==\"; # };\n};\n"
        "zone \"a\" /* IN */ { allow-update { key k; }; }; // \"",
        "key|k|algorithm|hmac-md5|secret|\"YQ==\"|zone|a.|primary|127.0.0.1|key|k");
    row("zone before its key, in views",
        "view a { zone \"a\" { type master; allow-update { key k; }; }; };\n"
        "view b { zone \"a\" { type slave; masters { 10.0.0.1 key k; }; }; };\n"
        "key k { secret \"YQ==\"; algorithm hmac-md5; };",
        "key|k|secret|\"YQ==\"|algorithm|hmac-md5|zone|a.|primary|127.0.0.1|key|k");
    row("Latin-1", "// \xFC\nkey k { algorithm a; secret \"YQ==\"; };", "key|k|algorithm|a|secret|\"YQ==\"");
}

void Bind9ReaderTest::preparesFile()
{
    QFETCH(QByteArray, content);
    QFETCH(QStringList, expected);
    const QTemporaryDir folder;
    writeTestFile(folder.filePath(QStringLiteral("named.conf.local")), content);
    QCOMPARE(preparedFrom(folder, "named.conf.local"), expected);
}

void Bind9ReaderTest::followsIncludes_data()
{
    QTest::addColumn<QByteArray>("local"); // named.conf.local; @ stands for the folder
    QTest::addColumn<QByteArray>("key");   // keys/ddns.key
    QTest::addColumn<QStringList>("expected");

    const QByteArray key{"key k { algorithm a; secret \"YQ==\"; };"};
    const QByteArray zone{"zone a { allow-update { key k; }; };"};
    const QStringList keyWords{words("key|k|algorithm|a|secret|\"YQ==\"")};
    const QStringList both{keyWords + words("zone|a.|primary|127.0.0.1|key|k")};
    QTest::newRow("absolute") << "include \"@/keys/ddns.key\";\n" + zone << key << both;
    QTest::newRow("relative") << "INCLUDE \"keys/ddns.key\" ;\n" + zone << key << both;
    QTest::newRow("behind the zone") << zone + "\ninclude \"keys/ddns.key\";\n" << key << both;
    QTest::newRow("within a zone") << "zone a { include \"keys/ddns.key\"; };" + key
                                   << QByteArray{"allow-update { key k; };"} << both;
    QTest::newRow("with a comment") << "include /* it */ \"keys/ddns.key\";\n" + zone << key + "// the key" << both;
    QTest::newRow("in a comment") << "// include \"keys/ddns.key\";\n" + zone << key << QStringList{};
    QTest::newRow("missing") << "include \"keys/other.key\";\n" + key << key << keyWords;
    QTest::newRow("a folder") << "include \"keys\";\n" + key << key << keyWords;
    QTest::newRow("itself") << "include \"named.conf.local\";\n" + key << key << keyWords;
    QTest::newRow("each other") << "include \"keys/ddns.key\";\n" + zone
                                << key + "include \"../keys/../named.conf.local\";" << both;
    QTest::newRow("within quotes") << R"(options { version "\"; }; include "keys/ddns.key"; // "; };)" + ('\n' + zone)
                                   << key << QStringList{};
    QTest::newRow("same file twice") << QByteArray{"include \"keys/ddns.key\";\n"}.repeated(2) << key << keyWords;
}

void Bind9ReaderTest::followsIncludes()
{
    QFETCH(QByteArray, local);
    QFETCH(QByteArray, key);
    QFETCH(QStringList, expected);
    const QTemporaryDir folder;
    QVERIFY(QDir{folder.path()}.mkdir(QStringLiteral("keys")));
    writeTestFile(folder.filePath(QStringLiteral("named.conf.local")), local.replace('@', folder.path().toUtf8()));
    writeTestFile(folder.filePath(QStringLiteral("keys/ddns.key")), key);
    QCOMPARE(preparedFrom(folder, "named.conf.local"), expected);
}

void Bind9ReaderTest::limitsDepthOfIncludes()
{
    const QTemporaryDir folder;
    for (int i{1}; i <= 40; ++i) {
        const QByteArray number{QByteArray::number(i)};
        writeTestFile(folder.filePath(QString::number(i)), "key k" + number +
                                                               " { algorithm a; secret YQ; };\ninclude \"" +
                                                               QByteArray::number(i + 1) + "\";");
    }
    const QStringList statements{preparedFrom(folder, "1")};
    QVERIFY(statements.contains(QStringLiteral("k16")));
    QVERIFY(!statements.contains(QStringLiteral("k17")));
}

void Bind9ReaderTest::limitsSizeOfIncludes()
{
    const QTemporaryDir folder;
    QByteArray main;
    for (int i{}; i < 30; ++i) {
        const QByteArray number{QByteArray::number(i)};
        main += "include \"" + number + "\";";
        writeTestFile(folder.filePath(QString::number(i)),
                      "key k" + number + " { algorithm a; secret YQ; };" + QByteArray(3'000'000, ' '));
    }
    writeTestFile(folder.filePath(QStringLiteral("main")), main);
    QCOMPARE(preparedFrom(folder, "main").count(QStringLiteral("secret")), 5);
}

// Small files that include each other would be read again and again.
void Bind9ReaderTest::limitsNumberOfFiles()
{
    const QTemporaryDir folder;
    QByteArray main;
    for (int i{}; i < 1'200; ++i) {
        const QByteArray number{QByteArray::number(i)};
        main += "include \"" + number + "\";";
        writeTestFile(folder.filePath(QString::number(i)), "key k" + number + " { algorithm a; secret YQ; };");
    }
    writeTestFile(folder.filePath(QStringLiteral("main")), main);
    QCOMPARE(preparedFrom(folder, "main").count(QStringLiteral("secret")), 999);
}

// Each of 16 files includes all of them three times.
void Bind9ReaderTest::comesToAnEndWhereFilesIncludeEachOther()
{
    const QTemporaryDir folder;
    QByteArray includes;
    for (int i{}; i < 16; ++i)
        includes += QByteArray{"include \"" + QByteArray::number(i) + "\";\n"}.repeated(3);
    for (int i{}; i < 16; ++i) {
        writeTestFile(folder.filePath(QString::number(i)),
                      "key k" + QByteArray::number(i) + " { algorithm a; secret YQ; };\n" + includes);
    }
    QCOMPARE(preparedFrom(folder, "0").count(QStringLiteral("secret")), 16);
}

void Bind9ReaderTest::givesNothingForUnreadableFile()
{
    const QTemporaryDir folder;
    QCOMPARE(preparedFrom(folder, "missing"), QStringList{});
    QCOMPARE(preparedFrom(folder, "."), QStringList{});
    QCOMPARE(preparedFrom(folder, "missing", {QStringLiteral("k")}), QStringList{});
}

// Whatever a text holds, the result is complete statements in an order that the server accepts.
void Bind9ReaderTest::survivesAnyText()
{
    static const QStringList pieces{
        words("\"|;|{|}|/|//|/*|*/|#| |\n|\r\n|zone |key |algorithm |secret |allow-update {|"
              "update-policy {|grant |view |type |file |IN |a|\"b\"|c.|k|primary|127.0.0.1|"
              "zone a {|zone \"b\" IN { allow-update { key k; }; };|key k {|"
              "key k { algorithm \"x\"; secret \"s\"; };|algorithm a; secret s;|key k;|include \"x\";|};")};
    QRandomGenerator random{20240607};
    int groups{};
    for (int round{}; round < 5'000; ++round) {
        QString text;
        for (int count{random.bounded(80)}; count > 0; --count)
            text += pieces.at(random.bounded(pieces.size()));

        const QStringList knownKeys{QStringLiteral("a")};
        for (const QStringList &statements :
             {bind9::statements(text), bind9::statements(bind9::zonesAndKeys(bind9::withoutComments(text)))}) {
            const QStringList result{bind9::usable(statements, knownKeys)};
            QCOMPARE(result.size() % 6, 0);
            QStringList keys{knownKeys};
            for (int i{}; i < result.size(); i += 6, ++groups) {
                const QString &keyword{result.at(i)};
                if (keyword == QLatin1String{"key"})
                    keys += values::unquoted(result.at(i + 1)).toLower();
                else if (keyword == QLatin1String{"zone"})
                    QVERIFY(keys.contains(values::unquoted(result.at(i + 5)).toLower()));
                else
                    QFAIL(qPrintable(keyword));
            }
        }
    }
    QVERIFY(groups > 1'000);
}

void Bind9ReaderTest::tellsWhatIsLeftOut_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QStringList>("knownKeys");
    QTest::addColumn<QStringList>("allKeys");
    QTest::addColumn<QStringList>("statements");
    QTest::addColumn<QStringList>("leftOut");

    const auto row = [](const char *name, const char *text, const char *statements, const char *leftOut,
                        const char *knownKeys = "", const char *allKeys = "") {
        QTest::addRow("%s", name) << QString::fromUtf8(text) << words(knownKeys) << words(allKeys) << words(statements)
                                  << words(leftOut);
    };
    constexpr auto both = "key|k|algorithm|a|secret|YQ|zone|a.|primary|127.0.0.1|key|k";
    constexpr auto keyAndZone = "key k { algorithm a; secret YQ; }; zone a { allow-update { key k; }; };";
    row("nothing", keyAndZone, both, "");
    row("copy of a zone", "zone a { type slave; masters { 10.0.0.1; }; }; zone \".\" { type hint; };", "",
        "a: not primary|: not primary");
    row("no key", "zone a { type master; }; zone b { allow-update { 10.0.0.1; }; };", "", "a: no key|b: no key");
    row("unknown key", "zone a { allow-update { key \"k\"; }; };", "", "a: unknown key k", "l", "l");
    row("first of its keys", "zone a { allow-update { key x; key y; }; };", "", "a: unknown key x");
    row("refused name",
        "key k { algorithm a; secret YQ; }; zone \"0/25.1.in-addr.arpa\" { allow-update { key k; }; };"
        "zone \"_msdcs.a.org.\" { allow-update { key k; }; };",
        "key|k|algorithm|a|secret|YQ", "0/25.1.in-addr.arpa: refused name k|_msdcs.a.org: refused name k");
    row("refused key", "key k { algorithm a; secret \"Y-Q=\"; }; zone a { allow-update { key k; }; };", "",
        "a: refused key k");
    row("refused key of the configuration", "key k { algorithm a; secret Y; }; zone a { allow-update { key k; }; };",
        "zone|a.|primary|127.0.0.1|key|k", "", "k", "k");
    row("usable key behind a refused one",
        "key l { algorithm a; secret Y; }; key k { algorithm a; secret YQ; }; zone a { allow-update { key l; key k; }; "
        "};",
        both, "");
    row("key behind", keyAndZone, "", "a: key behind k", "", "K");
    row("key behind that the files do not have", "zone a { allow-update { key k; }; };", "", "a: key behind k", "l",
        "l|k");
    row("key before", "zone a { allow-update { key k; }; };", "zone|a.|primary|127.0.0.1|key|k", "", "k", "k|l");
    row("key before and behind", "zone a { allow-update { key k; }; };", "zone|a.|primary|127.0.0.1|key|k", "", "k",
        "k|k");
    row("key before whose name needs quotes", "zone a { allow-update { key _k; }; };",
        "zone|a.|primary|127.0.0.1|key|\"_k\"", "", "_k", "_k");
}

void Bind9ReaderTest::tellsWhatIsLeftOut()
{
    QFETCH(QString, text);
    QFETCH(QStringList, knownKeys);
    QFETCH(QStringList, allKeys);
    QFETCH(QStringList, statements);
    QFETCH(QStringList, leftOut);
    const bind9::Preparation preparation{bind9::preparedText(text, knownKeys, allKeys)};
    QCOMPARE(preparation.statements, statements);
    QCOMPARE(described(preparation.leftOut), leftOut);
}

void Bind9ReaderTest::leavesOutWhatTheServerRefuses_data()
{
    QTest::addColumn<QString>("keyName");
    QTest::addColumn<QString>("algorithm");
    QTest::addColumn<QString>("secret");
    QTest::addColumn<QString>("zone");
    QTest::addColumn<bool>("isAccepted");

    const auto row = [](const QString &keyName, const QString &algorithm, const QString &secret, const QString &zone,
                        bool isAccepted) {
        const QString name{keyName + QLatin1Char{' '} + algorithm + QLatin1Char{' '} + secret + QLatin1Char{' '} +
                           zone};
        QTest::addRow("%s", qPrintable(name.left(60))) << keyName << algorithm << secret << zone << isAccepted;
    };
    const auto texts = [](std::initializer_list<const char *> list) {
        QStringList result;
        std::transform(list.begin(), list.end(), std::back_inserter(result),
                       [](auto *text) { return QString::fromUtf8(text); });
        return result;
    };
    const QString key{QStringLiteral("k")};
    const QString algorithm{QStringLiteral("hmac-md5")};
    const QString secret{QStringLiteral("YQ==")};
    const QString zone{QStringLiteral("a.org")};
    const QString tooLong(1'500, QLatin1Char{'A'});
    for (const QString &name : texts({"k", "\"k\"", "k.", "k-a.b_c", "9", "-", "if", "zone", "algorithm"}))
        row(name, algorithm, secret, zone, true);
    row(tooLong, algorithm, secret, zone, false);
    for (const QString &text : texts({"hmac-md5", "\"hmac-sha256\"", "HMAC-MD5.SIG-ALG.REG.INT.", "type"}))
        row(key, text, secret, zone, true);
    for (const QString &text : texts({"a..b", "_a", "a/b", "\"a b\"", "\xC3\xA4"}))
        row(key, text, secret, zone, false);
    for (const QString &text :
         texts({"YQ", "\"YQ==\"", "YWI=", "YWJj", "YR==", "YWF=", "+/+/", "9999", "AA=", "\"ab//\"", "zone"}))
        row(key, algorithm, text, zone, true);
    for (const QString &text : texts(
             {"Y", "YR", "YWF", "99", "Y=", "YQ==YQ==", "\"YQ=\\\"\"", "Y-Q=", "\"Y_Q=\"", "if", "\xC3\xA4", "'YQ=='"}))
        row(key, algorithm, text, zone, false);
    row(key, algorithm, tooLong, zone, false);
    row(key, algorithm, tooLong.left(1'499), zone, true);
    for (const QString &name :
         texts({"a.org", "\"a.org.\"", "1.168.192.in-addr.arpa", "0-25.1", "zone", "if.type", "-a.b-", "a_b"}))
        row(key, algorithm, secret, name, true);
    for (const QString &name :
         texts({"_a.org", "a._b", "\"0/25.1\"", "a..b", "\"*.a\"", "a..", "\xC3\xA4.org", "a@b", "\"a\\b\"", "a+b"}))
        row(key, algorithm, secret, name, false);
}

// The server itself tells what it refuses: all of it as the files have it.
void Bind9ReaderTest::leavesOutWhatTheServerRefuses()
{
    QFETCH(QString, keyName);
    QFETCH(QString, algorithm);
    QFETCH(QString, secret);
    QFETCH(QString, zone);
    QFETCH(bool, isAccepted);
    const QString text{
        QStringLiteral("key %1 { algorithm %2; secret %3; };\nzone %4 { type master; allow-update { key %1; "
                       "}; };\n")
            .arg(keyName, algorithm, secret, zone)};
    const bind9::Preparation preparation{bind9::preparedText(text, {})};
    QCOMPARE(preparation.leftOut.isEmpty(), isAccepted);
    QCOMPARE(preparation.statements.contains(QStringLiteral("zone")), isAccepted);

    const QString dhcpd{realDhcpd()};
    if (dhcpd.isEmpty())
        QSKIP("no DHCP server");
    QCOMPARE(complaintOf(dhcpd, configurationWith(preparation.statements)), QString{});
    QString zoneName{values::unquoted(zone)};
    if (!zoneName.endsWith(QLatin1Char{'.'}))
        zoneName += QLatin1Char{'.'};
    const QString literal{
        QStringLiteral("key %1 { algorithm %2; secret %3; }\nzone %4 { primary 127.0.0.1; key %1; }\n")
            .arg(keyName, values::unquoted(algorithm), secret, zoneName)};
    QCOMPARE(complaintOf(dhcpd, literal.toUtf8()).isEmpty(), isAccepted);
}

// Keys and zones of any characters, hundreds in one configuration.
void Bind9ReaderTest::givesTheServerNothingThatItRefuses()
{
    const QString dhcpd{realDhcpd()};
    if (dhcpd.isEmpty())
        QSKIP("no DHCP server");
    QRandomGenerator random{20261121};
    const auto anyWord = [&random](const char *characters) {
        const QString alphabet{QString::fromUtf8(characters)};
        QString word;
        for (int length{random.bounded(1, 7)}; length > 0; --length)
            word += alphabet.at(random.bounded(alphabet.size()));
        return random.bounded(3) == 0 ? values::quoted(word) : word;
    };
    QStringList::size_type keys{};
    QStringList::size_type zones{};
    for (int round{}; round < 40; ++round) {
        QString text;
        for (int i{}; i < 200; ++i) {
            const QString key{anyWord("abk9-_./+:\xC3\xA4*'")};
            text += QStringLiteral("key %1 { algorithm %2; secret %3; };\n")
                        .arg(key, anyWord("amd5-_./"), anyWord("YQa9+/==AgEw-"));
            text += QStringLiteral("zone %1 { allow-update { key %2; }; };\n").arg(anyWord("abz19-_./*"), key);
        }
        const QStringList statements{bind9::preparedText(text, {}).statements};
        keys += statements.count(QStringLiteral("secret"));
        zones += statements.count(QStringLiteral("zone"));
        const QString complaint{complaintOf(dhcpd, configurationWith(statements))};
        QVERIFY2(complaint.isEmpty(), qPrintable(complaint + QString::fromUtf8(configurationWith(statements))));
    }
    QVERIFY(keys > 400);
    QVERIFY(zones > 100);
}

QTEST_GUILESS_MAIN(Bind9ReaderTest)
#include "tst_bind9reader.moc"
