// SPDX-License-Identifier: GPL-3.0-or-later
#include <QFile>
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
    QString translation;
    bool finished{false};

    QString name() const { return context + QLatin1Char{'|'} + source; }
};

QString germanFile() { return QStringLiteral(SOURCE_FOLDER "/translations/orv-admin-dhcp_de.ts"); }

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
            message.translation = xml.readElementText();
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

} // namespace

/// The translations as files and as they are compiled into the program.
class TranslationFilesTest final : public QObject
{
    Q_OBJECT

private slots:
    void germanHasTheTextsOfTheProgram();
    void germanIsCompleteAndAlike_data();
    void germanIsCompleteAndAlike();
    void germanIsLoadedFromTheProgram_data();
    void germanIsLoadedFromTheProgram();
    void textsComeOutInGerman_data();
    void textsComeOutInGerman();
    void englishIsFoundAndChangesNothing();
};

void TranslationFilesTest::germanHasTheTextsOfTheProgram()
{
    const QTemporaryDir folder;
    const QString fresh{folder.filePath(QStringLiteral("fresh.ts"))};
    QProcess lupdate;
    lupdate.setWorkingDirectory(QStringLiteral(SOURCE_FOLDER));
    lupdate.start(QStringLiteral(LUPDATE), {QStringLiteral("-silent"), QStringLiteral("-I"), QStringLiteral("."),
                                            QStringLiteral("@translations/folders.lst"), QStringLiteral("-ts"), fresh});
    QVERIFY2(lupdate.waitForFinished(-1), qPrintable(lupdate.errorString()));
    QCOMPARE(lupdate.exitCode(), 0);

    const QStringList inProgram{namesOf(messagesOf(fresh))};
    QVERIFY(!inProgram.isEmpty());
    QCOMPARE(namesOf(messagesOf(germanFile())), inProgram);
}

void TranslationFilesTest::germanIsCompleteAndAlike_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QString>("translation");
    QTest::addColumn<bool>("finished");
    for (const Message &message : messagesOf(germanFile())) {
        QTest::addRow("%s", qPrintable(message.name().simplified()))
            << message.source << message.translation << message.finished;
    }
}

void TranslationFilesTest::germanIsCompleteAndAlike()
{
    QFETCH(QString, source);
    QFETCH(QString, translation);
    QFETCH(bool, finished);

    QVERIFY(finished);
    QVERIFY(!translation.isEmpty());
    for (const char *pattern : {"%[1-9]", "\n", "&(?=\\w)", "^ ", " $", ":$"})
        QCOMPARE(matchesOf(pattern, translation), matchesOf(pattern, source));
}

void TranslationFilesTest::germanIsLoadedFromTheProgram_data()
{
    QTest::addColumn<QString>("locale");
    for (const char *locale : {"de_DE", "de_AT", "de_CH"})
        QTest::addRow("%s", locale) << QString::fromLatin1(locale);
}

void TranslationFilesTest::germanIsLoadedFromTheProgram()
{
    QFETCH(QString, locale);
    QTranslator translator;
    QVERIFY(translator.load(QLocale{locale}, QStringLiteral("orv-admin-dhcp"), QStringLiteral("_"),
                            QStringLiteral(":/i18n")));
    for (const Message &message : messagesOf(germanFile())) {
        QCOMPARE(translator.translate(message.context.toUtf8().constData(), message.source.toUtf8().constData()),
                 message.translation);
    }
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
    translator.load(QLocale{QStringLiteral("en_US")}, QStringLiteral("orv-admin-dhcp"), QStringLiteral("_"),
                    QStringLiteral(":/i18n"));
    QVERIFY(translator.isEmpty());
}

QTEST_GUILESS_MAIN(TranslationFilesTest)
#include "tst_translationfiles.moc"
