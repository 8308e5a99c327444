// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/configreader.h"
#include "config/configwriter.h"
#include "tests/config/confignode.h"
#include "tests/support/text.h"

#include <QRandomGenerator>
#include <QTest>

namespace {

const QStringList plainWords{
    QStringLiteral("option"),     QStringLiteral("subnet"),
    QStringLiteral("\"quoted\""), QStringLiteral("\"#\""),
    QStringLiteral("10.0.0.1"),   QStringLiteral("Zürich"),
    QStringLiteral("\r"),         QStringLiteral("\\"),
    QStringLiteral("\uFEFF"),     QStringLiteral("\a\x7F"),
    QStringLiteral("日本"),       QString{QChar{}},
    QStringLiteral("ranges"),     QStringLiteral("😀"),
    QStringLiteral("=,()[]"),     QStringLiteral("x").repeated(300),
};
const QStringList declarationKeywords{QStringLiteral("range"), QStringLiteral("SUBCLASS"),
                                      QStringLiteral("Fixed-Address")};

QString pick(QRandomGenerator &random, const QStringList &words) { return words[random.bounded(words.size())]; }

// Words as the reader makes them: at least two, none empty but the filler, every quote closed.
QStringList randomWords(QRandomGenerator &random)
{
    QStringList words;
    for (int count{1 + random.bounded(4)}; count > 0; --count)
        words += pick(random, plainWords);
    if (random.bounded(4) == 0)
        words += {QStringLiteral("\"#a"), QStringLiteral("#"), QStringLiteral("b\"")};
    if (words.size() == 1)
        words += QString{};
    return words;
}

ConfigNode randomBlock(QRandomGenerator &random, int depth)
{
    ConfigNode node{randomWords(random)};
    for (int count{random.bounded(4)}; count > 0; --count)
        node.parameters.push_back({randomWords(random)});
    for (int count{depth > 0 ? random.bounded(4) : 0}; count > 0; --count) {
        ConfigNode child;
        if (random.bounded(2) == 0) {
            child.words = randomWords(random);
            if (child.words.last().isEmpty())
                child.words.removeLast();
            child.words.insert(random.bounded(child.words.size() + 1), pick(random, declarationKeywords));
        } else {
            child = randomBlock(random, depth - 1);
        }
        node.declarations.push_back(child);
    }
    return node;
}

} // namespace

class ConfigWriterTest final : public QObject
{
    Q_OBJECT

private slots:
    void rewrites_data();
    void rewrites();
    void writesEditedTrees_data();
    void writesEditedTrees();
    void writesParamAlone();
    void writesBothTopRows();
    void readsBackWhatItWrote();
    void refusesATextThatIsTooLong();
    void refusesBlocksNestedTooDeep();
    void keepsBytes();
};

void ConfigWriterTest::rewrites_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("written");
    const auto addRow = [](const char *name, const char *text, const char *written) {
        QTest::addRow("%s", name) << QString::fromUtf8(text) << QString::fromUtf8(written);
    };
    addRow("parameters first, without comments and layout",
           "subnet 10.0.0.0 netmask 255.255.255.0 {\n"
           "  range 10.0.0.10 10.0.0.20;\n"
           "  option routers 10.0.0.1; # gw\n"
           "}\n"
           "authoritative;\n",
           "authoritative ;\n"
           "subnet 10.0.0.0 netmask 255.255.255.0 {\n"
           "    option routers 10.0.0.1;\n"
           "    range 10.0.0.10 10.0.0.20;\n"
           "}\n");
    addRow("empty", "", "");
    addRow("empty block of one word", "group{}", "group  {\n}\n");
    addRow("nested", "a b{c d{e f{g h;}}}", "a b {\n    c d {\n        e f {\n            g h;\n        }\n    }\n}\n");
    addRow("quoted runs of spaces", "a \"b   c\td\";", "a \"b c d\";\n");
    addRow("keyword at a later position becomes an empty block", "option foo range;", "option foo range {\n}\n");
    addRow("keywords in capitals", "RANGE 1;Subclass 2;fixed-ADDRESS 3;", "RANGE 1;\nSubclass 2;\nfixed-ADDRESS 3;\n");
    addRow("a subclass keeps its body", "subclass \"a\" 1:2 { option x y; b { c d; } }",
           "subclass \"a\" 1:2 {\n    option x y;\n    b  {\n        c d;\n    }\n}\n");
    addRow("so does a range, even if the server knows none", "range 1 2 { a b; }", "range 1 2 {\n    a b;\n}\n");
    addRow("empty bodies go", "subclass 1 2 {} fixed-address 1 {}", "subclass 1 2;\nfixed-address 1;\n");
    addRow("carriage returns stay in their words", "a b\r\n;", "a b\r;\n");
}

void ConfigWriterTest::rewrites()
{
    QFETCH(QString, text);
    const auto top = makeTop();
    QVERIFY(readUnder(*top, text));
    QTEST(QString::fromUtf8(serialize(*top)), "written");
    QTEST(QString::fromUtf8(serialize(*top->child(0))), "written");
}

void ConfigWriterTest::writesEditedTrees_data()
{
    QTest::addColumn<ConfigNode>("tree");
    QTest::addColumn<QByteArray>("written");
    const auto addRow = [](const char *name, const ConfigNode &tree, const char *written) {
        QTest::addRow("%s", name) << tree << QByteArray{written};
    };
    const ConfigNode param{split("p|1")};
    addRow("parameter without a keyword", {{}, {{split("|1")}, param, {QStringList{}}}}, "p 1;\n");
    addRow("declaration without a keyword", {{}, {}, {{split("|1"), {param}, {{split("d|1")}}}, {{}, {param}}}}, "");
    addRow("one word", {{}, {{split("p")}}, {{split("d")}, {split("range")}}}, "p;\nd {\n}\nrange;\n");
    addRow("range with children", {{}, {}, {{split("range|1"), {param}, {{split("d|1")}}}}}, "range 1;\n");
    addRow("subclass with children", {{}, {}, {{split("subclass|1"), {param}}}}, "subclass 1;\n");
    addRow("fixed address with children", {{}, {}, {{split("fixed-address|1"), {param}}}}, "fixed-address 1;\n");
    addRow("empty words between", {{}, {{split("p||1||")}}}, "p  1  ;\n");
    addRow("a word with spaces", {{}, {{split("option|routers|1, 2")}}}, "option routers 1, 2;\n");
}

void ConfigWriterTest::writesEditedTrees()
{
    QFETCH(ConfigNode, tree);
    const auto top = makeTop();
    DhcpdConfigDeclaration *allNetwork{readUnder(*top, {})};
    addChildren(*allNetwork, tree);
    QTEST(serialize(*top), "written");
}

void ConfigWriterTest::writesParamAlone()
{
    const auto top = makeTop();
    QVERIFY(readUnder(*top, QStringLiteral("a { b c; }")));
    QCOMPARE(serialize(*top->child(0)->child(0)->child(0)), QByteArray{"    b c;\n"});
    QCOMPARE(serialize(*top->child(0)->child(0)), QByteArray{"a  {\n    b c;\n}\n"});
}

void ConfigWriterTest::writesBothTopRows()
{
    const auto top = makeTop();
    QVERIFY(readUnder(*top, QStringLiteral("a b { c d; } e f;")));
    QVERIFY(readUnder(*top, QStringLiteral("g h;")));
    QCOMPARE(serialize(*top), QByteArray{"e f;\na b {\n    c d;\n}\ng h;\n"});
}

void ConfigWriterTest::readsBackWhatItWrote()
{
    QRandomGenerator random{20'221'202};
    for (int i{}; i < 3000; ++i) {
        ConfigNode tree{randomBlock(random, 5)};
        tree.words = split("All network|");
        const auto top = makeTop();
        addChildren(*readUnder(*top, {}), tree);
        const QByteArray written{serialize(*top)};
        const auto topAgain = makeTop();
        const auto *again = topAgain->addDeclaration(
            readConfiguration({written.constData(), static_cast<std::size_t>(written.size())}, *topAgain));
        QCOMPARE(nodeOf(*again), tree);
        QCOMPARE(serialize(*topAgain), written);
    }
}

void ConfigWriterTest::refusesATextThatIsTooLong()
{
    // Some two kilobytes of indentation for each of the innermost statements.
    QByteArray text;
    for (int depth{0}; depth < 499; ++depth)
        text += "a {";
    const auto top = makeTop();
    QVERIFY(readUnder(*top, QString::fromLatin1(text + QByteArray{"b;"}.repeated(600'000))));
    QVERIFY(serialize(*top).isNull());
    QVERIFY(!serialize(*makeTop()).isNull());
}

// With words behind the keyword it is a declaration, which stands no deeper than its block but is written as if it did.
void ConfigWriterTest::refusesBlocksNestedTooDeep()
{
    const QString blocks{QStringLiteral("a {").repeated(maximumBlockDepth)};
    const auto top = makeTop();
    QVERIFY(readUnder(*top, blocks + QStringLiteral("range 1 2;")));
    QVERIFY(!serialize(*top).isNull());
    QVERIFY(readUnder(*top, blocks + QStringLiteral("option foo range;")));
    QVERIFY(serialize(*top).isNull());
}

void ConfigWriterTest::keepsBytes()
{
    const QByteArray text{"a \xFF\xC0;\nb \xED\xA0\x80\0z {\n}\n", 18};
    const auto top = makeTop();
    top->addDeclaration(readConfiguration({text.constData(), static_cast<std::size_t>(text.size())}, *top));
    QCOMPARE(serialize(*top), text);
}

QTEST_GUILESS_MAIN(ConfigWriterTest)
#include "tst_configwriter.moc"
