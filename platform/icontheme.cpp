// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/icontheme.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QMap>
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

using IconThemes = QMap<QString, IconTheme>;

// The theme's own entries stand in the first group; the groups after it, one for each folder, are most of the file.
std::optional<IconTheme> readIndex(const QString &path)
{
    QFile file{path};
    if (!file.open(QIODevice::ReadOnly))
        return {};
    IconTheme theme;
    bool inFirstGroup{false};
    while (!file.atEnd()) {
        const QString line{QString::fromUtf8(file.readLine()).trimmed()};
        if (line.startsWith(QLatin1Char('['))) {
            if (inFirstGroup)
                break;
            inFirstGroup = true;
        }
        const QString key{line.section(QLatin1Char('='), 0, 0).trimmed()};
        const QStringList values{line.section(QLatin1Char('='), 1).split(QLatin1Char(','), Qt::SkipEmptyParts)};
        if (key == QLatin1String("Directories"))
            theme.folders = values;
        else if (key == QLatin1String("Inherits"))
            theme.parents = values;
        else if (key == QLatin1String("Hidden") && values.value(0) == QLatin1String("true"))
            return {};
    }
    return theme;
}

IconThemes installedThemes(const QStringList &searchPaths)
{
    IconThemes themes;
    for (const QString &searchPath : searchPaths) {
        const QDir parent{searchPath};
        for (const QString &name : parent.entryList(QDir::Dirs | QDir::NoDotAndDotDot)) {
            const std::optional<IconTheme> theme{readIndex(parent.filePath(name + QStringLiteral("/index.theme")))};
            if (!theme || theme->folders.isEmpty() || themes.contains(name))
                continue;
            IconTheme &added{themes[name]};
            added.parents = theme->parents;
            for (const QString &folder : theme->folders)
                added.folders.append(parent.filePath(name + QLatin1Char('/') + folder.trimmed() + QLatin1Char('/')));
        }
    }
    return themes;
}

bool hasIcon(const IconTheme &theme, const QString &name)
{
    const QString drawing{name + QStringLiteral(".svg")};
    const QString picture{name + QStringLiteral(".png")};
    return std::any_of(theme.folders.cbegin(), theme.folders.cend(), [&](const QString &folder) {
        return QFileInfo::exists(folder + drawing) || QFileInfo::exists(folder + picture);
    });
}

bool hasIconOrInherits(const IconThemes &themes, const QString &theme, const QString &name, QSet<QString> &visited)
{
    const auto found{themes.constFind(theme)};
    if (found == themes.cend() || visited.contains(theme))
        return false;
    visited.insert(theme);
    return hasIcon(*found, name) ||
           std::any_of(found->parents.cbegin(), found->parents.cend(), [&](const QString &parent) {
               return hasIconOrInherits(themes, parent.trimmed(), name, visited);
           });
}

// Themes with an even count of names: those that look best beside the bundled icons first.
int preference(const QString &theme)
{
    static const QStringList preferred{
        QStringLiteral("breeze"), QStringLiteral("breeze-dark"), QStringLiteral("oxygen"),
        QStringLiteral("mate"),   QStringLiteral("Papirus"),     QStringLiteral("elementary-xfce"),
        QStringLiteral("gnome"),  QStringLiteral("Adwaita"),
    };
    const int index{preferred.indexOf(theme)};
    return index < 0 ? preferred.size() : index;
}

bool suitsPalette(const QString &theme, bool darkPalette)
{
    const bool dark{theme.contains(QLatin1String("dark"), Qt::CaseInsensitive)};
    const bool highContrast{theme.contains(QLatin1String("contrast"), Qt::CaseInsensitive)};
    return !highContrast && dark == darkPalette;
}

} // namespace

QString suitableIconTheme(const QStringList &searchPaths, const QStringList &names, bool darkPalette)
{
    const IconThemes themes{installedThemes(searchPaths)};
    std::optional<std::tuple<bool, std::ptrdiff_t, int, QString>> best;
    for (auto theme = themes.keyBegin(); theme != themes.keyEnd(); ++theme) {
        const auto found{std::count_if(names.cbegin(), names.cend(), [&](const QString &name) {
            QSet<QString> visited;
            return hasIconOrInherits(themes, *theme, name, visited);
        })};
        if (2 * found < names.size())
            continue;
        const std::tuple rank{!suitsPalette(*theme, darkPalette), -found, preference(*theme), *theme};
        if (!best || rank < *best)
            best = rank;
    }
    return best ? std::get<QString>(*best) : QString{};
}
