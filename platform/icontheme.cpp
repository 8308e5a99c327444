// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/icontheme.h"

#include <QDir>
#include <QFile>
#include <QSet>

#include <algorithm>
#include <optional>
#include <tuple>

namespace {

struct IconTheme
{
    QStringList folders; ///< where its icons lie
    QStringList parents;
};

// The theme's own entries are in the first group; the groups after it, one for each folder, are most of the file.
std::optional<IconTheme> readIndex(const QString &path)
{
    QFile file{path};
    if (!file.open(QIODevice::ReadOnly))
        return {};
    IconTheme theme;
    bool inFirstGroup{false};
    while (!file.atEnd()) {
        const QString line{QString::fromUtf8(file.readLine()).trimmed()};
        if (line.startsWith(QLatin1Char{'['})) {
            if (inFirstGroup)
                break;
            inFirstGroup = true;
        }
        const QString key{line.section(QLatin1Char{'='}, 0, 0).trimmed()};
        const QStringList values{line.section(QLatin1Char{'='}, 1).split(QLatin1Char{','}, Qt::SkipEmptyParts)};
        if (key == QLatin1String{"Directories"})
            theme.folders = values;
        else if (key == QLatin1String{"Inherits"})
            theme.parents = values;
        else if (key == QLatin1String{"Hidden"} && values.value(0) == QLatin1String{"true"})
            return {};
    }
    return theme;
}

// Of a theme in several search paths, the first that has a valid index counts.
IconTheme findTheme(const QStringList &searchPaths, const QString &name)
{
    for (const QString &searchPath : searchPaths) {
        const QString root{searchPath + QLatin1Char{'/'} + name + QLatin1Char{'/'}};
        std::optional<IconTheme> theme{readIndex(root + QStringLiteral("index.theme"))};
        if (!theme || theme->folders.isEmpty())
            continue;
        for (QString &folder : theme->folders)
            folder = root + folder.trimmed() + QLatin1Char{'/'};
        return *theme;
    }
    return {};
}

// The folders of the theme and of all that it inherits from, except those of the `visited` themes.
QStringList foldersOf(const QStringList &searchPaths, const QString &name, QSet<QString> &visited)
{
    if (visited.contains(name))
        return {};
    visited.insert(name);
    const IconTheme theme{findTheme(searchPaths, name)};
    QStringList folders{theme.folders};
    // A theme without folders is one of cursors, and what it inherits does not concern icons.
    if (!folders.isEmpty()) {
        for (const QString &parent : theme.parents)
            folders += foldersOf(searchPaths, parent.trimmed(), visited);
    }
    return folders;
}

bool hasIcon(const QStringList &folders, const QString &name)
{
    return std::any_of(folders.cbegin(), folders.cend(), [&](const QString &folder) {
        return QFile::exists(folder + name + QStringLiteral(".svg")) ||
               QFile::exists(folder + name + QStringLiteral(".png"));
    });
}

// Stops as soon as the answer is known: a missing name costs a look into every folder.
bool hasHalf(const QStringList &folders, const QStringList &names)
{
    int found{0};
    int missing{0};
    for (const QString &name : names) {
        ++(hasIcon(folders, name) ? found : missing);
        if (2 * found >= names.size() || 2 * missing > names.size())
            break;
    }
    return 2 * found >= names.size();
}

// The themes that look best beside the bundled icons come first.
QStringList::size_type preference(const QString &theme)
{
    static const QStringList preferred{
        QStringLiteral("breeze"), QStringLiteral("breeze-dark"), QStringLiteral("oxygen"),
        QStringLiteral("mate"),   QStringLiteral("Papirus"),     QStringLiteral("elementary-xfce"),
        QStringLiteral("gnome"),  QStringLiteral("Adwaita"),
    };
    const QStringList::size_type index{preferred.indexOf(theme)};
    return index < 0 ? preferred.size() : index;
}

bool suitsPalette(const QString &theme, bool darkPalette)
{
    const bool dark{theme.contains(QLatin1String{"dark"}, Qt::CaseInsensitive)};
    const bool highContrast{theme.contains(QLatin1String{"contrast"}, Qt::CaseInsensitive)};
    return !highContrast && dark == darkPalette;
}

QStringList installedThemes(const QStringList &searchPaths)
{
    QStringList names;
    for (const QString &searchPath : searchPaths)
        names += QDir{searchPath}.entryList(QDir::Dirs | QDir::NoDotAndDotDot);
    return names;
}

} // namespace

QString suitableIconTheme(const QStringList &searchPaths, const QStringList &names, bool darkPalette)
{
    QStringList themes{installedThemes(searchPaths)};
    const auto rank = [darkPalette](const QString &theme) {
        return std::tuple{!suitsPalette(theme, darkPalette), preference(theme), theme};
    };
    std::sort(themes.begin(), themes.end(),
              [&rank](const QString &left, const QString &right) { return rank(left) < rank(right); });
    const auto chosen = std::find_if(themes.cbegin(), themes.cend(), [&](const QString &theme) {
        // What every theme falls back on says nothing about this one.
        QSet<QString> visited{fallbackIconTheme};
        return hasHalf(foldersOf(searchPaths, theme, visited), names);
    });
    return chosen == themes.cend() ? QString{} : *chosen;
}
