// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/configreader.h"
#include "tests/config/referencereader.h"

#include <QDir>
#include <QFile>
#include <QRandomGenerator>
#include <QTest>

using Lines = std::vector<int>;
Q_DECLARE_METATYPE(Lines)

namespace {

ConfigNode node(const char *words) { return {QString::fromUtf8(words).split(QLatin1Char{'|'})}; }

ConfigNode allNetwork(std::vector<ConfigNode> parameters = {}, std::vector<ConfigNode> declarations = {})
{
    ConfigNode tree{node("All network|")};
    tree.parameters = std::move(parameters);
    tree.declarations = std::move(declarations);
    return tree;
}

ConfigNode block(const char *words, std::vector<ConfigNode> parameters, std::vector<ConfigNode> declarations = {})
{
    ConfigNode tree{node(words)};
    tree.parameters = std::move(parameters);
    tree.declarations = std::move(declarations);
    return tree;
}

QString nestedBlocks(int depth)
{
    return QStringLiteral("a {").repeated(depth) + QStringLiteral("b c;") + QStringLiteral("}").repeated(depth);
}

// A text of everything that means something to the reader, with what it must not trip over.
QString randomText(QRandomGenerator &random)
{
    static const QStringList pieces{
        QStringLiteral(";"),      QStringLiteral("{"),        QStringLiteral("}"),
        QStringLiteral(" "),      QStringLiteral("\t"),       QStringLiteral("\n"),
        QStringLiteral("\r\n"),   QStringLiteral("\""),       QStringLiteral("#"),
        QStringLiteral("a"),      QStringLiteral("range"),    QStringLiteral("SubClass"),
        QStringLiteral("option"), QStringLiteral("\\\""),     QStringLiteral("10.0.0.1"),
        QStringLiteral("Zürich"), QStringLiteral("\uFEFF"),   QStringLiteral("\u017F"),
        QStringLiteral("\u212A"), QString{QChar{}},           QStringLiteral("ſubclass"),
        QStringLiteral("}"),      QStringLiteral("host h {"), QStringLiteral("fixed-address"),
    };
    QString text;
    for (int count{random.bounded(60)}; count > 0; --count)
        text += pieces[random.bounded(pieces.size())];
    return text;
}

} // namespace

class ConfigReaderTest final : public QObject
{
    Q_OBJECT

private slots:
    void reads_data();
    void reads();
    void refusesDeepNesting_data();
    void refusesDeepNesting();
    void countsOpenBlocksOnly();
    void agreesWithReference();
    void agreesWithReferenceOnFiles_data();
    void agreesWithReferenceOnFiles();
    void endsOnAnyBytes_data();
    void endsOnAnyBytes();
    void notesWhatItDoesNotKeep_data();
    void notesWhatItDoesNotKeep();
};

void ConfigReaderTest::reads_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<ConfigNode>("tree");
    const auto addRow = [](const char *name, const char *text, const ConfigNode &tree) {
        QTest::addRow("%s", name) << QString::fromUtf8(text) << tree;
    };
    addRow("subnet and parameter",
           "subnet 10.0.0.0 netmask 255.255.255.0 {\n"
           "  range 10.0.0.10 10.0.0.20;\n"
           "  option routers 10.0.0.1; # gw\n"
           "}\n"
           "authoritative;\n",
           allNetwork({node("authoritative|")},
                      {block("subnet|10.0.0.0|netmask|255.255.255.0", {node("option|routers|10.0.0.1")},
                             {node("range|10.0.0.10|10.0.0.20")})}));
    addRow("empty file", "", allNetwork());
    addRow("blanks only", " \t\n\n", allNetwork());
    addRow("comment only", "# a; b { c }\n", allNetwork());
    addRow("comment between words", "a # x;\nb;", allNetwork({node("a|b")}));
    addRow("comment right after a word", "a#x;\nb;", allNetwork({node("a|b")}));
    addRow("comment without line feed", "a b;\n# the end", allNetwork({node("a|b")}));
    addRow("comment without line feed after words", "a b;\nc d # the end", allNetwork({node("a|b")}));
    addRow("comment sign at the very end", "a b;#", allNetwork({node("a|b")}));
    addRow("comment sign in quotes", "option domain-name \"a#b\";", allNetwork({node("option|domain-name|\"a#b\"")}));
    addRow("quoted text is split at spaces", "option domain-name \"my domain\";",
           allNetwork({node("option|domain-name|\"my|domain\"")}));
    addRow("quoted runs of spaces", "a \"b  \t c\";", allNetwork({node("a|\"b|c\"")}));
    addRow("semicolon in quotes", R"(a "b;c";)", allNetwork({node("a|\"b"), node("c\"|")}));
    addRow("braces in quotes", R"(a "b{c";}"d e;)", allNetwork({node("\"d|e")}, {block("a|\"b", {node("c\"|")})}));
    addRow("escaped quote is a quote", "a \"b\\\" # c;\nd;", allNetwork({node(R"(a|"b\"|d)")}));
    addRow("unbalanced quote takes comment signs in", "a \";# b\n c;d \" #e;\nf;",
           allNetwork({node("a|\""), node("#|b|c"), node("d|\"|f")}));
    addRow("quotes in comments do not count", "a; # \"\nb; # c;\nd;", allNetwork({node("a|"), node("b|"), node("d|")}));
    addRow("quotes in dropped words count", "a { \"} #b c;", allNetwork({node("#b|c")}, {node("a|")}));
    addRow("no semicolon before the brace", "host a { fixed-address 10.0.0.5 }", allNetwork({}, {node("host|a")}));
    addRow("brace without words", "group { { a b; } c d; } e f;",
           allNetwork({node("c|d"), node("e|f")}, {block("group|", {node("a|b")})}));
    addRow("surplus closing braces", "} a b; } } c d;", allNetwork({node("a|b"), node("c|d")}));
    addRow("surplus semicolons", ";; a b;;; ;c;", allNetwork({node("a|b"), node("c|")}));
    addRow("open blocks", "group { host a { b c;",
           allNetwork({}, {block("group|", {}, {block("host|a", {node("b|c")})})}));
    addRow("dropped at the end", "a b; c d", allNetwork({node("a|b")}));
    addRow("one word", "authoritative;", allNetwork({node("authoritative|")}));
    addRow("one word and a block", "group{}", allNetwork({}, {node("group|")}));
    addRow("range", "range 1 2;", allNetwork({}, {node("range|1|2")}));
    addRow("fixed-address", "fixed-address 1, 2;", allNetwork({}, {node("fixed-address|1,|2")}));
    addRow("subclass", "subclass \"a\" b;", allNetwork({}, {node("subclass|\"a\"|b")}));
    addRow("subclass with a block", "subclass \"a\" b { c d; }",
           allNetwork({}, {block("subclass|\"a\"|b", {node("c|d")})}));
    addRow("range at a later position", "option foo range;", allNetwork({}, {node("option|foo|range")}));
    addRow("capitals", "x RANGE; y Fixed-Address 1; SUBCLASS;",
           allNetwork({}, {node("x|RANGE"), node("y|Fixed-Address|1"), node("SUBCLASS|")}));
    addRow("a part of a word is no keyword", "ranges 1; arange 2; \"range\" 3;",
           allNetwork({node("ranges|1"), node("arange|2"), node("\"range\"|3")}));
    addRow("a keyword of a dropped statement", "group { range } a b;", allNetwork({node("a|b")}, {node("group|")}));
    addRow("range after a declaration keyword ended", "range 1 2; a b;",
           allNetwork({node("a|b")}, {node("range|1|2")}));
    addRow("CR LF", "a b;\r\nc {\r\n}\r\n", allNetwork({node("a|b")}, {node("\r|c")}));
    addRow("vertical tab and form feed are ordinary", "a\vb\fc d;", allNetwork({node("a\vb\fc|d")}));
    addRow("beyond ASCII", "# Zürich\nhost zürich { }", allNetwork({}, {node("host|zürich")}));
    QTest::addRow("NUL") << QString{QStringLiteral("a ") + QChar{} + QStringLiteral("b;") + QChar{}}
                         << allNetwork({{{QStringLiteral("a"), QString{QChar{}} + QLatin1Char{'b'}}}});
    QTest::addRow("byte order mark") << QStringLiteral("\uFEFFa b;")
                                     << allNetwork({{{QStringLiteral("\uFEFFa"), QStringLiteral("b")}}});
    const QString longWord{100'000, QLatin1Char{'x'}};
    QTest::addRow("long word") << longWord + QStringLiteral(" b;") << allNetwork({{{longWord, QStringLiteral("b")}}});
    QStringList manyWords;
    for (int i{}; i < 10'000; ++i)
        manyWords += QString::number(i);
    QTest::addRow("many words") << manyWords.join(QLatin1Char{'\n'}) + QLatin1Char{';'} << allNetwork({{manyWords}});
}

void ConfigReaderTest::reads()
{
    QFETCH(QString, text);
    QFETCH(ConfigNode, tree);
    const auto top = makeTop();
    const DhcpdConfigDeclaration *read{readUnder(*top, text)};
    QVERIFY(read);
    QCOMPARE(nodeOf(*read), tree);
    QCOMPARE(read->parent(), top.get());
    QCOMPARE(read->depth(), -1);
    QCOMPARE(readByReference(text), tree);
}

void ConfigReaderTest::refusesDeepNesting_data()
{
    QTest::addColumn<int>("depth");
    QTest::addColumn<bool>("isRead");
    QTest::addRow("usual") << 3 << true;
    QTest::addRow("deepest") << maximumBlockDepth << true;
    QTest::addRow("one deeper") << maximumBlockDepth + 1 << false;
    QTest::addRow("far deeper") << 1'000'000 << false;
}

void ConfigReaderTest::refusesDeepNesting()
{
    QFETCH(int, depth);
    QFETCH(bool, isRead);
    const auto top = makeTop();
    const DhcpdConfigDeclaration *tree{readUnder(*top, nestedBlocks(depth))};
    QCOMPARE(tree != nullptr, isRead);
    QCOMPARE(top->childCount(), isRead ? 1 : 0);
    if (tree)
        QCOMPARE(blockDepth(nodeOf(*tree)), depth);
}

void ConfigReaderTest::countsOpenBlocksOnly()
{
    const auto top = makeTop();
    const DhcpdConfigDeclaration *tree{
        readUnder(*top, (nestedBlocks(maximumBlockDepth) + QStringLiteral(" range 1 2;")).repeated(3))};
    QVERIFY(tree);
    QCOMPARE(tree->childCount(), 6);
    const DhcpdConfigDeclaration *deepRanges{
        readUnder(*top, QStringLiteral("a {").repeated(maximumBlockDepth) + QStringLiteral("range 1 2;"))};
    QVERIFY(deepRanges);
}

void ConfigReaderTest::agreesWithReference()
{
    QRandomGenerator random{20'221'201};
    for (int i{}; i < 20'000; ++i) {
        const QString text{randomText(random)};
        const auto top = makeTop();
        const DhcpdConfigDeclaration *tree{readUnder(*top, text)};
        QVERIFY2(tree && nodeOf(*tree) == readByReference(text), qPrintable(text.toHtmlEscaped()));
    }
}

void ConfigReaderTest::agreesWithReferenceOnFiles_data()
{
    QTest::addColumn<QString>("path");
    const QDir corpus{QFINDTESTDATA("../fuzz/configreader")};
    const QFileInfoList files{corpus.entryInfoList(QDir::Files)};
    QVERIFY(!files.isEmpty());
    for (const QFileInfo &file : files)
        QTest::addRow("%s", qPrintable(file.fileName())) << file.filePath();
}

void ConfigReaderTest::agreesWithReferenceOnFiles()
{
    QFETCH(QString, path);
    QFile file{path};
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QString text{QString::fromUtf8(file.readAll())};
    const ConfigNode expected{readByReference(text)};
    const auto top = makeTop();
    const DhcpdConfigDeclaration *tree{readUnder(*top, text)};
    QCOMPARE(tree != nullptr, blockDepth(expected) <= maximumBlockDepth);
    if (tree)
        QCOMPARE(nodeOf(*tree), expected);
}

void ConfigReaderTest::endsOnAnyBytes_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("children");
    QTest::addRow("NUL bytes") << QByteArray(100'000, '\0') << 0;
    QTest::addRow("invalid UTF-8") << QByteArray("a \xFF\xC0\x80; b\xED\xA0\x80 {} \xF5") << 2;
    QTest::addRow("cut off character") << QByteArray("a \xE2\x82;") << 1;
    QTest::addRow("quotes") << QByteArray(100'001, '"') << 0;
    QTest::addRow("comment signs") << QByteArray(100'000, '#') << 0;
    QTest::addRow("opening braces") << QByteArray(100'000, '{') << 0;
    QTest::addRow("closing braces") << QByteArray(100'000, '}') << 0;
    QTest::addRow("semicolons") << QByteArray(100'000, ';') << 0;
    QTest::addRow("statements") << QByteArray("a;").repeated(50'000) << 50'000;
    QTest::addRow("blocks") << QByteArray("a{}").repeated(30'000) << 30'000;
    QTest::addRow("words without an end") << QByteArray("a ").repeated(50'000) << 0;
}

void ConfigReaderTest::endsOnAnyBytes()
{
    QFETCH(QByteArray, bytes);
    const auto top = makeTop();
    const auto tree = readConfiguration({bytes.constData(), static_cast<std::size_t>(bytes.size())}, *top);
    QVERIFY(tree);
    QTEST(tree->childCount(), "children");
}

void ConfigReaderTest::notesWhatItDoesNotKeep_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<int>("comments");
    QTest::addColumn<Lines>("quotedTexts");
    QTest::addColumn<Lines>("statements");
    QTest::addColumn<Lines>("carriageReturns");
    const auto row = [](const char *name, const char *content, int comments, const Lines &quotedTexts,
                        const Lines &statements = {}, const Lines &carriageReturns = {}) {
        QTest::addRow("%s", name) << QByteArray{content} << comments << quotedTexts << statements << carriageReturns;
    };
    row("nothing", "a b;\nc { d \"e f\"; }\n", 0, {});
    row("comments", "# a\nb; # c \" # d\n#\n", 3, {});
    row("comment sign in quotes", "a \"# b\"; # c\n", 1, {});
    row("semicolons", "a;\noption vend \"s1ip=10.1.29.8;p1=4100;a1=1;\";\n", 0, {2});
    row("braces", "\n\nfilename \"http://x?mac={mac}\";\n", 0, {3});
    row("blanks in a row", "a \"a   b\";\n", 0, {1});
    row("tab", "a \"a\tb\";\n", 0, {1});
    row("line feed", "a;\nb \"c\nd\"; e \"  \";\n", 0, {2, 3});
    row("single blanks", "a \" b c \"  \"\";\n", 0, {});
    row("escaped quote", "a;\noption x \"5\\\" disk\"; # b\n", 0, {2});
    row("escaped backslash", "a \"b\\\\\"; # c\n", 1, {});
    row("keyword in quotes", "a;\nlog(info, \"bad range asked\");\n", 0, {2});
    row("keyword behind others", "a;\nb subclass c;\n", 0, {}, {2});
    row("keyword at the start", "range a b; fixed-address range; subclass \"range\" 1;\n", 0, {});
    row("keyword in the heading of a block", "a range b { c; }\n", 0, {});
    row("carriage returns", "a;\r\nb;\nc {\r\n}\r\n", 0, {}, {}, {1, 3, 4});
    row("several in a line", "a \"b;\" \"c;\"; d \"e;\";\nf \"g;\";\n", 0, {1, 2});
    row("quoted text without an end", "a \"b;\n", 0, {});
}

void ConfigReaderTest::notesWhatItDoesNotKeep()
{
    QFETCH(QByteArray, content);
    const auto top = makeTop();
    ReadingLosses losses;
    QVERIFY(readConfiguration({content.constData(), static_cast<std::size_t>(content.size())}, *top, &losses));
    QTEST(losses.comments, "comments");
    QTEST(losses.quotedTextLines, "quotedTexts");
    QTEST(losses.statementLines, "statements");
    QTEST(losses.carriageReturnLines, "carriageReturns");
}

QTEST_GUILESS_MAIN(ConfigReaderTest)
#include "tst_configreader.moc"
