// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvinit.h"

#include "platform/icontheme.h"

#include <QDirIterator>
#include <QFileInfo>
#include <QGuiApplication>
#include <QIcon>
#include <QPalette>

namespace {

QString &description()
{
    static QString text;
    return text;
}

// The program asks for the icons that it bundles, and for no others.
QStringList usedIconNames()
{
    QStringList names;
    QDirIterator icons{QStringLiteral(":/icons/hicolor/scalable/actions")};
    while (icons.hasNext())
        names.append(QFileInfo{icons.next()}.completeBaseName());
    return names;
}

// Qt reads one index for each theme, the first that it finds. The system's index of the fallback theme lists hundreds
// of folders, takes longer to read than all the icons take to draw, and has none that the program needs and ours lacks.
void useBundledIcons()
{
    const QString bundled{QStringLiteral(":/icons")};
    QStringList paths{QIcon::themeSearchPaths()};
    paths.removeAll(bundled);
    paths.prepend(bundled);
    QIcon::setThemeSearchPaths(paths);
    if (QIcon::fallbackThemeName().isEmpty())
        QIcon::setFallbackThemeName(fallbackIconTheme);
}

void chooseIconTheme()
{
    const QString named{QIcon::themeName()};
    if (!named.isEmpty() && named != fallbackIconTheme)
        return;
    const bool darkPalette{QGuiApplication::palette().color(QPalette::Window).lightness() < 128};
    const QString chosen{suitableIconTheme(QIcon::themeSearchPaths(), usedIconNames(), darkPalette)};
    // Without a theme name Qt looks nowhere, not even among the bundled icons.
    QIcon::setThemeName(chosen.isEmpty() ? QString{fallbackIconTheme} : chosen);
}

} // namespace

void orvSetAttributes()
{
    QCoreApplication::setAttribute(Qt::AA_EnableHighDpiScaling);
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
    // Nothing here draws with OpenGL; without this the first window loads all of it, which takes longer than the rest.
    QCoreApplication::setAttribute(Qt::AA_ForceRasterWidgets);
}

void orvInit(const char *version, const char *descriptionText)
{
    Q_INIT_RESOURCE(platform);
    QCoreApplication::setApplicationVersion(QString::fromUtf8(version));
    description() = QString::fromUtf8(descriptionText);
    useBundledIcons();
    chooseIconTheme();
}

QString orvDescription() { return description(); }
