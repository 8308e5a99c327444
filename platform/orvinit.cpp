// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvinit.h"

#include "platform/icontheme.h"

#include <QDirIterator>
#include <QFileInfo>
#include <QGuiApplication>
#include <QIcon>
#include <QPalette>

namespace {

const QLatin1String lastResortTheme{"hicolor"};

QString &description()
{
    static QString text;
    return text;
}

// The names that the program asks for are those it bundles a drawing for.
QStringList usedIconNames()
{
    QStringList names;
    QDirIterator icons{QStringLiteral(":/icons/hicolor/scalable/actions")};
    while (icons.hasNext())
        names.append(QFileInfo{icons.next()}.completeBaseName());
    return names;
}

void chooseIconTheme()
{
    // The bundled icons are part of it.
    if (QIcon::fallbackThemeName().isEmpty())
        QIcon::setFallbackThemeName(lastResortTheme);
    const QString named{QIcon::themeName()};
    if (!named.isEmpty() && named != lastResortTheme)
        return;
    const bool darkPalette{QGuiApplication::palette().color(QPalette::Window).lightness() < 128};
    const QString chosen{suitableIconTheme(QIcon::themeSearchPaths(), usedIconNames(), darkPalette)};
    // Without a theme name Qt looks nowhere, not even among the bundled icons.
    QIcon::setThemeName(chosen.isEmpty() ? QString{lastResortTheme} : chosen);
}

} // namespace

void orvInit(const char *version, const char *descriptionText)
{
    Q_INIT_RESOURCE(platform);
    QCoreApplication::setApplicationVersion(QString::fromUtf8(version));
    description() = QString::fromUtf8(descriptionText);
    chooseIconTheme();
}

QString orvDescription() { return description(); }
