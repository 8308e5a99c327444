// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/manualpage.h"

#include <QFile>
#include <QHash>
#include <QLocale>
#include <QRegularExpression>

namespace {

// The text of a line, with the few escapes that the page uses replaced by what they stand for.
QString plainText(QString line)
{
    static const QRegularExpression escape{QStringLiteral(R"(\\(-|&|f[BIR]|\(bu))")};
    line.replace(QLatin1String{"\\-"}, QLatin1String{"-"});
    return line.remove(escape).remove(QLatin1Char{'"'}).toHtmlEscaped();
}

// The page in the first of the user's languages that there is one in, as QTranslator finds a translation.
QString pagePath()
{
    const QString folder{QStringLiteral(":/man/")};
    const QStringList languages{QLocale{}.uiLanguages()};
    for (QString language : languages) {
        language.replace(QLatin1Char{'-'}, QLatin1Char{'_'});
        for (; !language.isEmpty(); language.truncate(language.lastIndexOf(QLatin1Char{'_'}))) {
            if (QFile::exists(folder + language))
                return folder + language;
        }
    }
    return folder + QLatin1String{"en"};
}

} // namespace

// Knows only the macros that the page uses: headings, paragraphs, emphasis, and tagged paragraphs, whose first line is
// the tag.
QString manualPageHtml()
{
    static const QHash<QString, QString> forms{
        {QStringLiteral(".SH"), QStringLiteral("<h3>%1</h3>")}, {QStringLiteral(".BR"), QStringLiteral("%1 ")},
        {QStringLiteral(".B"), QStringLiteral("<b>%1</b> ")},   {QStringLiteral(".I"), QStringLiteral("<i>%1</i> ")},
        {QStringLiteral(".PP"), QStringLiteral("<p>%1")},       {QStringLiteral(".TP"), QStringLiteral("<p>%1")},
    };
    QFile page{pagePath()};
    if (!page.open(QIODevice::ReadOnly))
        return {};
    QString html;
    bool tagFollows{false};
    while (!page.atEnd()) {
        const QString line{QString::fromUtf8(page.readLine()).trimmed()};
        const QString macro{line.section(QLatin1Char{' '}, 0, 0)};
        const bool isMacro{line.startsWith(QLatin1Char{'.'})};
        if (forms.contains(macro))
            html += forms.value(macro).arg(plainText(line.section(QLatin1Char{' '}, 1)));
        else if (!isMacro)
            html += plainText(line) + QLatin1Char{' '};
        if (tagFollows)
            html += QStringLiteral("<br>");
        tagFollows = macro == QLatin1String{".TP"};
    }
    return html;
}
