// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/textencoding.h"

#include <QProcess>
#include <QRandomGenerator>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

#include <clocale>

namespace {

// The environment names another locale while this exists, compiled where it is not installed. The process stays in its
// own, as it does where Qt sees to that.
class EnvironmentLocale final
{
public:
    explicit EnvironmentLocale(const QByteArray &name) { qputenv("LC_ALL", name); }
    EnvironmentLocale(const QString &language, const QString &charset)
        : EnvironmentLocale{(language + QLatin1Char('.') + charset).toLatin1()}
    {
        const QString localedef{QStandardPaths::findExecutable(QStringLiteral("localedef"))};
        if (!localedef.isEmpty()) {
            QProcess::execute(localedef,
                              {QStringLiteral("--quiet"), QStringLiteral("-i"), language, QStringLiteral("-f"), charset,
                               m_folder.filePath(qEnvironmentVariable("LC_ALL"))});
        }
        qputenv("LOCPATH", m_folder.path().toLocal8Bit());
    }
    ~EnvironmentLocale()
    {
        qunsetenv("LOCPATH");
        qputenv("LC_ALL", "C.UTF-8");
    }
    Q_DISABLE_COPY_MOVE(EnvironmentLocale)

    static bool exists()
    {
        const locale_t locale{newlocale(LC_CTYPE_MASK, "", nullptr)};
        if (locale)
            freelocale(locale);
        return locale;
    }

private:
    QTemporaryDir m_folder;
};

QByteArray randomBytes(int length, QRandomGenerator &random)
{
    QByteArray bytes{length, '\0'};
    for (char &byte : bytes)
        byte = static_cast<char>(random.bounded(256));
    return bytes;
}

// Random bytes of which most are pieces of UTF-8.
QByteArray almostUtf8(QRandomGenerator &random)
{
    static const QVector<QByteArray> parts{"a",
                                           "options",
                                           "\xC3\xA9",
                                           "\xE2\x82\xAC",
                                           "\xF0\x9F\x98\x80",
                                           "\xEF\xBB\xBF",
                                           "\xED\x9F\xBF",
                                           "\xEE\x80\x80",
                                           "\xEF\xBF\xBF",
                                           "\xF4\x8F\xBF\xBF",
                                           "\xC2\x80"};
    QByteArray text;
    for (int i{random.bounded(12)}; i > 0; --i)
        text += parts.at(random.bounded(parts.size()));
    if (random.bounded(2) == 0 && !text.isEmpty())
        text[random.bounded(text.size())] = static_cast<char>(random.bounded(256));
    return random.bounded(4) == 0 ? text.left(text.size() - 1) : text;
}

bool qtTakesForUtf8(const QByteArray &bytes)
{
    const QByteArray marked{'x' + bytes}; // behind another character, a byte order mark is text
    return QString::fromUtf8(marked.constData(), marked.size()).toUtf8() == marked;
}

// In a UTF-8 locale: what is not UTF-8 is Latin-1, whose bytes beyond ASCII change when the text is taken as UTF-8.
bool isReadAsUtf8(const QByteArray &bytes) { return TextEncoding::detect(bytes, "UTF-8").toUtf8(bytes) == bytes; }

const QVector<QByteArray> locales{"UTF-8",        "US-ASCII", "ISO-8859-1", "ISO-8859-15", "KOI8-R",
                                  "windows-1251", "EUC-JP",   "Shift_JIS",  "GB18030",     "Big5"};

} // namespace

class TextEncodingTest final : public QObject
{
    Q_OBJECT

private slots:
    void readsInTheFirstEncodingThatFits_data();
    void readsInTheFirstEncodingThatFits();
    void textNobodyEditedKeepsItsBytes_data();
    void textNobodyEditedKeepsItsBytes();
    void anyBytesSurvive_data();
    void anyBytesSurvive();
    void agreesWithQtOnEveryShortSequence();
    void agreesWithQtOnRandomText();
    void doesNotCopyWhatIsUtf8_data();
    void doesNotCopyWhatIsUtf8();
    void doesNotCopyAsciiInAnyLocale();
    void writesWhatTheEncodingLacksAsUtf8_data();
    void writesWhatTheEncodingLacksAsUtf8();
    void convertsLargeTextsAcrossPieces_data();
    void convertsLargeTextsAcrossPieces();
    void asksTheCLibraryForTheLocale_data();
    void asksTheCLibraryForTheLocale();
    void takesTheCLocaleForUtf8();
    void newFileIsUtf8();
};

void TextEncodingTest::readsInTheFirstEncodingThatFits_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("text");

    const QString cafe{QStringLiteral("caf\u00E9")};
    QTest::addRow("UTF-8 in a UTF-8 locale") << QByteArray{"UTF-8"} << QByteArray{"caf\xC3\xA9"} << cafe;
    QTest::addRow("Latin-1 in a UTF-8 locale") << QByteArray{"UTF-8"} << QByteArray{"caf\xE9"} << cafe;
    QTest::addRow("both mixed in a UTF-8 locale")
        << QByteArray{"UTF-8"} << QByteArray{"\xC3\xA9\xE9"} << QStringLiteral("\u00C3\u00A9\u00E9");
    QTest::addRow("UTF-8 in an ASCII locale") << QByteArray{"US-ASCII"} << QByteArray{"caf\xC3\xA9"} << cafe;
    QTest::addRow("Latin-1 in an ASCII locale") << QByteArray{"US-ASCII"} << QByteArray{"caf\xE9"} << cafe;
    QTest::addRow("Latin-1 in its locale") << QByteArray{"ISO-8859-1"} << QByteArray{"caf\xE9"} << cafe;
    QTest::addRow("UTF-8 in a Latin-1 locale, where any bytes fit")
        << QByteArray{"ISO-8859-1"} << QByteArray{"caf\xC3\xA9"} << QStringLiteral("caf\u00C3\u00A9");
    QTest::addRow("KOI8-R in its locale")
        << QByteArray{"KOI8-R"} << QByteArray{"\xC4\xCF\xCD"} << QStringLiteral("\u0434\u043E\u043C");
    QTest::addRow("EUC-JP in its locale") << QByteArray{"EUC-JP"} << QByteArray{"\xC6\xFC"} << QStringLiteral("\u65E5");
    QTest::addRow("UTF-8 in an EUC-JP locale")
        << QByteArray{"EUC-JP"} << QByteArray{"\xF0\x9F\x98\x80 x"} << QString::fromUtf8("\xF0\x9F\x98\x80 x");
    QTest::addRow("Latin-1 in an EUC-JP locale")
        << QByteArray{"EUC-JP"} << QByteArray{"\xE9"} << QStringLiteral("\u00E9");
    QTest::addRow("a byte order mark stays")
        << QByteArray{"UTF-8"} << QByteArray{"\xEF\xBB\xBFx"} << QStringLiteral("\uFEFFx");
    QTest::addRow("NUL") << QByteArray{"UTF-8"} << QByteArray{"a\0b", 3}
                         << QString{QStringLiteral("a") + QChar{0} + QStringLiteral("b")};
    QTest::addRow("truncated sequence") << QByteArray{"UTF-8"} << QByteArray{"a\xE2\x82"}
                                        << QStringLiteral("a\u00E2\u0082");
    QTest::addRow("overlong form") << QByteArray{"UTF-8"} << QByteArray{"\xC0\xAF"} << QStringLiteral("\u00C0\u00AF");
    QTest::addRow("surrogate") << QByteArray{"UTF-8"} << QByteArray{"\xED\xA0\x80"}
                               << QStringLiteral("\u00ED\u00A0\u0080");
    QTest::addRow("Latin-1 in a locale whose control characters are not ASCII's")
        << QByteArray{"Shift_JIS"} << QByteArray{"\x7F\xE9"} << QStringLiteral("\u007F\u00E9");
    QTest::addRow("Latin-1 in a locale with another sign for the backslash")
        << QByteArray{"Shift_JIS"} << QByteArray{"\\\xB1"} << QStringLiteral("\\\u00B1");
    QTest::addRow("a last letter that others could join, in the locale of Hong Kong")
        << QByteArray{"BIG5-HKSCS"} << QByteArray{"\x88\x66"} << QStringLiteral("\u00CA");
    QTest::addRow("empty") << QByteArray{"KOI8-R"} << QByteArray{} << QString{};
}

void TextEncodingTest::readsInTheFirstEncodingThatFits()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, text);
    const TextEncoding encoding{TextEncoding::detect(bytes, locale)};

    QCOMPARE(encoding.decode(bytes), text);
    QCOMPARE(encoding.toUtf8(bytes), text.toUtf8());
}

void TextEncodingTest::textNobodyEditedKeepsItsBytes_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("bytes");
    const QVector<QByteArray> texts{"",
                                    "ascii only",
                                    "caf\xC3\xA9",
                                    "caf\xE9",
                                    "\xC3\xA9\xE9",
                                    "\xEF\xBB\xBFmark",
                                    {"nul\0nul\xE9", 8},
                                    "\xE2\x82",
                                    "\xF0\x9F\x98\x80",
                                    "\xEF\xBF\xBD",
                                    "\xC4\xCF\xCD",
                                    "\xC6\xFC\xCB\xDC",
                                    "\x81\x30\x81\x30",
                                    "\x80\x9F\xFF"};
    for (const QByteArray &locale : locales) {
        for (const QByteArray &text : texts)
            QTest::addRow("%s: %s", locale.constData(), text.toHex().constData()) << locale << text;
    }
}

void TextEncodingTest::textNobodyEditedKeepsItsBytes()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, bytes);
    const TextEncoding encoding{TextEncoding::detect(bytes, locale)};

    QCOMPARE(encoding.encode(encoding.decode(bytes)), bytes);
    QCOMPARE(encoding.fromUtf8(encoding.toUtf8(bytes)), bytes);
    QCOMPARE(encoding.toUtf8(bytes), encoding.decode(bytes).toUtf8());
}

void TextEncodingTest::anyBytesSurvive_data()
{
    QTest::addColumn<QByteArray>("locale");
    for (const QByteArray &locale : locales)
        QTest::addRow("%s", locale.constData()) << locale;
}

void TextEncodingTest::anyBytesSurvive()
{
    QFETCH(QByteArray, locale);
    QRandomGenerator random{1};
    for (int i{}; i < 500; ++i) {
        const QByteArray bytes{i % 2 == 0 ? randomBytes(random.bounded(40), random) : almostUtf8(random)};
        const TextEncoding encoding{TextEncoding::detect(bytes, locale)};
        QCOMPARE(encoding.encode(encoding.decode(bytes)), bytes);
        QCOMPARE(encoding.fromUtf8(encoding.toUtf8(bytes)), bytes);
    }
}

void TextEncodingTest::agreesWithQtOnEveryShortSequence()
{
    for (int first{0x80}; first < 0x100; ++first) {
        for (int second{}; second < 0x100; ++second) {
            for (const char *rest : {"", "\x80", "\xBF", "a", "\x80\x80", "\xBF\xBF", "\x80z", "\x80\xC0"}) {
                const QByteArray bytes{QByteArray{}.append(static_cast<char>(first)).append(static_cast<char>(second)) +
                                       rest};
                QVERIFY2(isReadAsUtf8(bytes) == qtTakesForUtf8(bytes), bytes.toHex());
            }
        }
    }
}

void TextEncodingTest::agreesWithQtOnRandomText()
{
    QRandomGenerator random{2};
    int valid{};
    constexpr int count{20000};
    for (int i{}; i < count; ++i) {
        const QByteArray bytes{almostUtf8(random)};
        valid += qtTakesForUtf8(bytes) ? 1 : 0;
        QVERIFY2(isReadAsUtf8(bytes) == qtTakesForUtf8(bytes), bytes.toHex());
    }
    QVERIFY(valid > count / 10 && valid < count - count / 10);
}

void TextEncodingTest::doesNotCopyWhatIsUtf8_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addRow("UTF-8") << QByteArray{"UTF-8"};
    QTest::addRow("US-ASCII") << QByteArray{"US-ASCII"};
}

void TextEncodingTest::doesNotCopyWhatIsUtf8()
{
    QFETCH(QByteArray, locale);
    const QByteArray bytes{QByteArray{"a longer line with caf\xC3\xA9\n"}.repeated(10)};
    const TextEncoding encoding{TextEncoding::detect(bytes, locale)};
    QCOMPARE(static_cast<const void *>(encoding.toUtf8(bytes).constData()),
             static_cast<const void *>(bytes.constData()));
    QCOMPARE(static_cast<const void *>(encoding.fromUtf8(bytes).constData()),
             static_cast<const void *>(bytes.constData()));
}

void TextEncodingTest::doesNotCopyAsciiInAnyLocale()
{
    const QByteArray bytes{QByteArray{"option domain-name \"x\";\n"}.repeated(10)};
    const TextEncoding encoding{TextEncoding::detect(bytes, "KOI8-R")};
    QCOMPARE(static_cast<const void *>(encoding.toUtf8(bytes).constData()),
             static_cast<const void *>(bytes.constData()));
    QCOMPARE(static_cast<const void *>(encoding.fromUtf8(bytes).constData()),
             static_cast<const void *>(bytes.constData()));
}

void TextEncodingTest::writesWhatTheEncodingLacksAsUtf8_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("edited");
    QTest::addColumn<QByteArray>("written");

    const QString euro{QStringLiteral("\u20AC")};
    const QString face{QString::fromUtf8("\xF0\x9F\x98\x80")};
    const QString cafe{QStringLiteral("caf\u00E9 ")};
    QTest::addRow("the euro in a Latin-1 file")
        << QByteArray{"UTF-8"} << QByteArray{"caf\xE9"} << cafe + euro << QByteArray{"caf\xE9 \xE2\x82\xAC"};
    QTest::addRow("first of the text") << QByteArray{"UTF-8"} << QByteArray{"caf\xE9"} << euro + cafe
                                       << QByteArray{"\xE2\x82\xAC"
                                                     "caf\xE9 "};
    QTest::addRow("alone") << QByteArray{"UTF-8"} << QByteArray{"\xE9"} << euro << QByteArray{"\xE2\x82\xAC"};
    QTest::addRow("several, beyond the first plane")
        << QByteArray{"UTF-8"} << QByteArray{"\xE9"} << face + cafe + face + face
        << QByteArray{"\xF0\x9F\x98\x80"
                      "caf\xE9 \xF0\x9F\x98\x80\xF0\x9F\x98\x80"};
    const QString tag{QString::fromUtf8("\xF3\xA0\x81\xA7")};
    QTest::addRow("what the C library passes over")
        << QByteArray{"UTF-8"} << QByteArray{"\xE9"} << cafe + tag << QByteArray{"caf\xE9 \xF3\xA0\x81\xA7"};
    QTest::addRow("an accent in a KOI8-R locale")
        << QByteArray{"KOI8-R"} << QByteArray{"\xC4"} << QStringLiteral("\u0434\u00E9\u0434")
        << QByteArray{"\xC4\xC3\xA9\xC4"};
    QTest::addRow("a typed accent in an ASCII file of a Latin-1 locale")
        << QByteArray{"ISO-8859-1"} << QByteArray{"x"} << QStringLiteral("\u00E9") << QByteArray{"\xE9"};
    QTest::addRow("a typed accent in an ASCII file of the C locale")
        << QByteArray{"US-ASCII"} << QByteArray{"x"} << QStringLiteral("\u00E9") << QByteArray{"\xC3\xA9"};
}

void TextEncodingTest::writesWhatTheEncodingLacksAsUtf8()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, file);
    QFETCH(QString, edited);
    QFETCH(QByteArray, written);
    const TextEncoding encoding{TextEncoding::detect(file, locale)};

    QCOMPARE(encoding.encode(edited), written);
    QCOMPARE(encoding.fromUtf8(edited.toUtf8()), written);
}

void TextEncodingTest::convertsLargeTextsAcrossPieces_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("pattern");
    QTest::addRow("Latin-1 file") << QByteArray{"UTF-8"} << QByteArray{"caf\xE9\n"};
    QTest::addRow("KOI8-R file") << QByteArray{"KOI8-R"} << QByteArray{"\xC4\xCF\xCD "};
    QTest::addRow("EUC-JP file") << QByteArray{"EUC-JP"} << QByteArray{"\xC6\xFCx"};
    QTest::addRow("GB18030 file with four-byte characters") << QByteArray{"GB18030"} << QByteArray{"\x94\x39\xFC\x36x"};
    QTest::addRow("UTF-8 file") << QByteArray{"UTF-8"} << QByteArray{"\xE2\x82\xAC"};
}

void TextEncodingTest::convertsLargeTextsAcrossPieces()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, pattern);
    const QByteArray bytes{'x' + pattern.repeated(100000)};

    const TextEncoding encoding{TextEncoding::detect(bytes, locale)};

    const TextEncoding small{TextEncoding::detect(pattern, locale)};
    QVERIFY(encoding.toUtf8(bytes) == 'x' + small.toUtf8(pattern).repeated(100000));
    QVERIFY(encoding.fromUtf8(encoding.toUtf8(bytes)) == bytes);
    QVERIFY(encoding.encode(encoding.decode(bytes)) == bytes);
}

void TextEncodingTest::asksTheCLibraryForTheLocale_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("charset");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("text");
    QTest::addRow("Latin-1") << QStringLiteral("de_DE") << QStringLiteral("ISO-8859-1") << QByteArray{"\xC3\xA9"}
                             << QStringLiteral("\u00C3\u00A9");
    QTest::addRow("KOI8-R") << QStringLiteral("ru_RU") << QStringLiteral("KOI8-R") << QByteArray{"\xC4"}
                            << QStringLiteral("\u0434");
}

void TextEncodingTest::asksTheCLibraryForTheLocale()
{
    QFETCH(QString, language);
    QFETCH(QString, charset);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, text);
    const EnvironmentLocale locale{language, charset};
    if (!EnvironmentLocale::exists())
        QSKIP("the locale is neither installed nor can it be compiled");

    const TextEncoding encoding{TextEncoding::detect(bytes)};

    QCOMPARE(encoding.decode(bytes), text);
    QCOMPARE(encoding.encode(text), bytes);
}

void TextEncodingTest::takesTheCLocaleForUtf8()
{
    const EnvironmentLocale locale{"C"};
    const TextEncoding encoding{TextEncoding::detect("caf\xC3\xA9")};
    QCOMPARE(encoding.decode("caf\xC3\xA9"), QStringLiteral("caf\u00E9"));
}

void TextEncodingTest::newFileIsUtf8()
{
    QCOMPARE(TextEncoding{}.encode(QStringLiteral("\uFEFF\u00E9")), QByteArray{"\xEF\xBB\xBF\xC3\xA9"});
    QCOMPARE(TextEncoding{}.decode("\xEF\xBB\xBF\xC3\xA9"), QStringLiteral("\uFEFF\u00E9"));
}

QTEST_GUILESS_MAIN(TextEncodingTest)
#include "tst_textencoding.moc"
