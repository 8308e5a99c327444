// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvinit.h"

#include "common/qtversions.h"
#include "platform/icontheme.h"

#include <QDirIterator>
#include <QEvent>
#include <QFileInfo>
#include <QGuiApplication>
#include <QIcon>
#include <QPalette>
#include <QPointer>

namespace {

QString &description()
{
    static QString text;
    return text;
}

const QString lightIcons{QStringLiteral(":/icons/light")};
const QString darkIcons{QStringLiteral(":/icons/dark")};

// The program asks for the icons that it bundles, and for no others.
QStringList usedIconNames()
{
    QStringList names;
    QDirIterator icons{lightIcons + QStringLiteral("/hicolor/scalable/actions")};
    while (icons.hasNext())
        names.append(QFileInfo{icons.next()}.completeBaseName());
    return names;
}

// Qt reads one index for each theme, the first that it finds. The system's index of the fallback theme lists hundreds
// of folders, takes longer to read than all the icons take to draw, and has none that the program needs and ours lacks.
void useBundledIcons(bool darkPalette)
{
    QStringList paths{QIcon::themeSearchPaths()};
    paths.removeAll(lightIcons);
    paths.removeAll(darkIcons);
    paths.prepend(darkPalette ? darkIcons : lightIcons);
    QIcon::setThemeSearchPaths(paths);
    if (QIcon::fallbackThemeName().isEmpty())
        QIcon::setFallbackThemeName(fallbackIconTheme);
}

void chooseIconTheme(bool darkPalette)
{
    const QString chosen{suitableIconTheme(QIcon::themeSearchPaths(), usedIconNames(), darkPalette)};
    // Without a theme name Qt looks nowhere, not even among the bundled icons.
    QIcon::setThemeName(chosen.isEmpty() ? QString{fallbackIconTheme} : chosen);
}

bool isDarkPalette() { return QGuiApplication::palette().color(QPalette::Window).lightness() < 128; }

/// Keeps the icons legible on the application's palette, whatever that becomes.
class PaletteIcons final : public QObject
{
public:
    explicit PaletteIcons(QObject *parent)
        : QObject{parent}
    {
        const QString named{QIcon::themeName()};
        m_choosesTheme = named.isEmpty() || named == fallbackIconTheme;
        choose();
        qApp->installEventFilter(this);
    }

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::ApplicationPaletteChange && watched == qApp && isDarkPalette() != m_isDark)
            choose();
        return false;
    }

private:
    void choose()
    {
        m_isDark = isDarkPalette();
        useBundledIcons(m_isDark);
        if (m_choosesTheme)
            chooseIconTheme(m_isDark);
    }

    bool m_choosesTheme{}; // rather than the desktop
    bool m_isDark{};
};

} // namespace

void orvSetAttributes()
{
    enableScreenReaders();
    enableHighDpi();
    // A screen of 144 dpi shows everything half as large again, rather than twice as large.
    QGuiApplication::setHighDpiScaleFactorRoundingPolicy(Qt::HighDpiScaleFactorRoundingPolicy::PassThrough);
    // Nothing here draws with OpenGL; without this the first window loads all of it, which takes longer than the rest.
    QCoreApplication::setAttribute(Qt::AA_ForceRasterWidgets);
}

void orvInit(const char *version, const char *descriptionText)
{
    Q_INIT_RESOURCE(platform);
    QCoreApplication::setApplicationVersion(QString::fromUtf8(version));
    description() = QString::fromUtf8(descriptionText);
    static QPointer<PaletteIcons> icons;
    delete icons;
    icons = new PaletteIcons{qApp};
}

QString orvDescription() { return description(); }
