// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/translations/languages.h"

#include <QFile>
#include <QFileInfo>
#include <QLocale>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QTest>
#include <QTranslator>
#include <QXmlStreamReader>

namespace {

struct Message final
{
    QString context;
    QString source;
    QStringList translations; // several where the text depends on a number
    bool finished{false};

    QString name() const
    {
        return QStringList{context, source, QString::number(translations.size())}.join(QLatin1Char{'|'});
    }
};

QString sourceFolder() { return QStringLiteral(SOURCE_FOLDER); }

QString fileOf(const QString &language)
{
    return sourceFolder() + QStringLiteral("/translations/orv-admin-dhcp_%1.ts").arg(language);
}

/// What the element "translation", which the reader has just entered, holds: a text, or one for each plural form.
QStringList readTranslations(QXmlStreamReader *xml)
{
    QString text;
    QStringList forms;
    while (xml->readNext() != QXmlStreamReader::EndElement && !xml->hasError()) {
        if (xml->isStartElement())
            forms.append(xml->readElementText());
        else
            text += xml->text();
    }
    return forms.isEmpty() ? QStringList{text} : forms;
}

/// The messages of a .ts file. Fails the test when it cannot be read.
QVector<Message> messagesOf(const QString &path)
{
    QFile file{path};
    if (!file.open(QIODevice::ReadOnly))
        QTest::qFail(qPrintable(path + QLatin1String{" cannot be read"}), __FILE__, __LINE__);
    QVector<Message> messages;
    QString context;
    QXmlStreamReader xml{&file};
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement)
            continue;
        if (xml.name() == QLatin1String{"name"}) {
            context = xml.readElementText();
        } else if (xml.name() == QLatin1String{"source"}) {
            messages.append({context, xml.readElementText(), {}});
        } else if (xml.name() == QLatin1String{"translation"}) {
            Message &message{messages.last()};
            message.finished = !xml.attributes().hasAttribute(QLatin1String{"type"});
            message.translations = readTranslations(&xml);
        }
    }
    if (xml.hasError())
        QTest::qFail(qPrintable(path + QLatin1String{": "} + xml.errorString()), __FILE__, __LINE__);
    return messages;
}

QStringList namesOf(const QVector<Message> &messages)
{
    QStringList names;
    for (const Message &message : messages)
        names.append(message.name());
    names.sort();
    return names;
}

/// What `pattern` matches in `text`, sorted, since languages differ in the order of their words.
QStringList matchesOf(const char *pattern, const QString &text)
{
    QStringList matches;
    QRegularExpressionMatchIterator each{QRegularExpression{QLatin1String{pattern}}.globalMatch(text)};
    while (each.hasNext())
        matches.append(each.next().captured());
    matches.sort();
    return matches;
}

/// The locales whose users get the translation of a language: all of its script, or those of the country that it names.
QStringList localesOf(const QString &language)
{
    const QLocale locale{language};
    const auto country = language.contains(QLatin1Char{'_'}) ? locale.country() : QLocale::AnyCountry;
    QStringList names;
    for (const QLocale &match : QLocale::matchingLocales(locale.language(), locale.script(), country))
        names.append(match.name());
    return names;
}

void addLanguageRows()
{
    QTest::addColumn<QString>("language");
    for (const QString &language : translatedLanguages())
        QTest::addRow("%s", qPrintable(language)) << language;
}

} // namespace

/// The translations as files and as they are compiled into the program.
class TranslationFilesTest final : public QObject
{
    Q_OBJECT

private slots:
    void everyFileIsInTheProgram();
    void hasTheTextsOfTheProgram_data() { addLanguageRows(); }
    void hasTheTextsOfTheProgram();
    void isCompleteAndAlike_data();
    void isCompleteAndAlike();
    void isLoadedFromTheProgram_data();
    void isLoadedFromTheProgram();
    void hasAGlossary_data() { addLanguageRows(); }
    void hasAGlossary();
    void textsComeOutInGerman_data();
    void textsComeOutInGerman();
    void englishIsFoundAndChangesNothing();
};

void TranslationFilesTest::everyFileIsInTheProgram()
{
    QStringList files{QStringLiteral("orv-admin-dhcp_en.ts")};
    for (const QString &language : translatedLanguages())
        files.append(QFileInfo{fileOf(language)}.fileName());
    files.sort();
    QCOMPARE(files, QDir{sourceFolder() + QStringLiteral("/translations")}.entryList({QStringLiteral("*.ts")}));
    QVERIFY(files.contains(QStringLiteral("orv-admin-dhcp_de.ts")));
}

// A message has as many plural forms as lupdate makes for the language.
void TranslationFilesTest::hasTheTextsOfTheProgram()
{
    QFETCH(QString, language);
    const QTemporaryDir folder;
    const QString fresh{folder.filePath(QStringLiteral("fresh.ts"))};
    QProcess lupdate;
    lupdate.setWorkingDirectory(sourceFolder());
    lupdate.start(QStringLiteral(LUPDATE),
                  {QStringLiteral("-silent"), QStringLiteral("-I"), QStringLiteral("."),
                   QStringLiteral("@translations/folders.lst"), QStringLiteral("-target-language"), language,
                   QStringLiteral("-ts"), fresh});
    QVERIFY2(lupdate.waitForFinished(-1), qPrintable(lupdate.errorString()));
    QCOMPARE(lupdate.exitCode(), 0);

    const QStringList inProgram{namesOf(messagesOf(fresh))};
    QVERIFY(!inProgram.isEmpty());
    QCOMPARE(namesOf(messagesOf(fileOf(language))), inProgram);
}

void TranslationFilesTest::isCompleteAndAlike_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QStringList>("translations");
    QTest::addColumn<bool>("finished");
    for (const QString &language : translatedLanguages()) {
        for (const Message &message : messagesOf(fileOf(language))) {
            QTest::addRow("%s|%s", qPrintable(language), qPrintable(message.name().simplified()))
                << message.source << message.translations << message.finished;
        }
    }
}

void TranslationFilesTest::isCompleteAndAlike()
{
    QFETCH(QString, source);
    QFETCH(const QStringList, translations);
    QFETCH(bool, finished);

    QVERIFY(finished);
    for (QString translation : translations) {
        QVERIFY(!translation.isEmpty());
        translation.replace(QChar{0xFF1A}, QLatin1Char{':'}); // the wide one of Chinese and Japanese
        for (const char *pattern : {"%(?:[1-9]|n)", "\n", "&(?=\\p{L})", "^ ", " $", ":$"})
            QCOMPARE(matchesOf(pattern, translation), matchesOf(pattern, source));
    }
}

void TranslationFilesTest::isLoadedFromTheProgram_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("locale");
    for (const QString &language : translatedLanguages()) {
        for (const QString &locale : localesOf(language))
            QTest::addRow("%s for %s", qPrintable(language), qPrintable(locale)) << language << locale;
    }
}

void TranslationFilesTest::isLoadedFromTheProgram()
{
    QFETCH(QString, language);
    QFETCH(QString, locale);
    QTranslator translator;
    QVERIFY(translator.load(QLocale{locale}, QStringLiteral("orv-admin-dhcp"), QStringLiteral("_"),
                            QStringLiteral(":/i18n")));
    for (const Message &message : messagesOf(fileOf(language))) {
        const QString text{
            translator.translate(message.context.toUtf8().constData(), message.source.toUtf8().constData())};
        QVERIFY2(message.translations.contains(text), qPrintable(message.name()));
    }
}

void TranslationFilesTest::hasAGlossary()
{
    QFETCH(QString, language);
    QVERIFY(QFile::exists(sourceFolder() + QStringLiteral("/translations/glossary-%1.md").arg(language)));
}

void TranslationFilesTest::textsComeOutInGerman_data()
{
    QTest::addColumn<QString>("german");
    const auto row = [](const char *context, const char *text, const char *german) {
        QTest::addRow("%s|%s", context, text) << QString::fromUtf8(german);
    };
    row("FMain", "Topology", "Topologie");
    row("FMain", "&File", "&Datei");
    row("OrvHelpMenu", "&Help", "&Hilfe");
    row("DhcpdConfigStatement", "All network", "Gesamtes Netzwerk");
    row("DhcpdConfigStatement", "Range", "Adressbereich");
    // Next to large numbers in the code, where lupdate can miss them.
    row("DhcpdConfigStatement", " mounth ", " Mon. ");
    row("DhcpdConfigStatement", " days ", " Tg. ");
    row("DhcpdConfigStatement", " hours ", " Std. ");
    row("DhcpdConfigStatement", " minutes ", " Min. ");
    row("DhcpdConfigStatement", " seconds ", " Sek. ");
    row("DhcpdConfigModel", "Invalid MAC '%1'", "Ungültige MAC-Adresse „%1“");
    row("DhcpdLeasesModel", "Rental start", "Lease-Beginn");
    row("QAbstractTableModel", "Net mask", "Netzmaske");
    row("QDialog", "Select interfaces", "Schnittstellen auswählen");
    row("QObject", "DHCP-server is running", "DHCP-Server läuft");
    row("TimeInputDialog", "Mounth:", "Monate:");
}

void TranslationFilesTest::textsComeOutInGerman()
{
    QTranslator translator;
    QVERIFY(translator.load(QStringLiteral(":/i18n/orv-admin-dhcp_de.qm")));
    const QList<QByteArray> name{QByteArray{QTest::currentDataTag()}.split('|')};
    QFETCH(QString, german);
    QCOMPARE(translator.translate(name.first().constData(), name.last().constData()), german);
}

void TranslationFilesTest::englishIsFoundAndChangesNothing()
{
    QVERIFY(QFile::exists(QStringLiteral(":/i18n/orv-admin-dhcp_en.qm")));
    QTranslator translator;
    // Whether Qt calls an empty translation loaded does not matter.
    static_cast<void>(translator.load(QLocale{QStringLiteral("en_US")}, QStringLiteral("orv-admin-dhcp"),
                                      QStringLiteral("_"), QStringLiteral(":/i18n")));
    QVERIFY(translator.isEmpty());
}

QTEST_GUILESS_MAIN(TranslationFilesTest)
#include "tst_translationfiles.moc"
