// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/referencereader.h"

#include <algorithm>

ConfigNode readByReference(const QString &text)
{
    ConfigNode allNetwork{{QStringLiteral("All network"), QString{}}, {}, {}};
    std::vector<ConfigNode *> open{&allNetwork};
    QString word;
    QStringList words;
    bool quoted{false};
    for (int i{0}; i < text.size(); ++i) {
        QChar c{text[i]};
        if (c == QLatin1Char{'"'}) {
            quoted = !quoted;
            word += c;
            continue;
        }
        if (c == QLatin1Char{'#'} && !quoted) {
            while (i < text.size() && text[i] != QLatin1Char{'\n'})
                ++i;
            if (i == text.size())
                break;
            c = text[i];
        }
        if (!QStringLiteral("\t\n ;{}").contains(c)) {
            word += c;
            continue;
        }
        if (!word.isEmpty())
            words += word;
        word.clear();
        if (QStringLiteral("\t\n ").contains(c))
            continue;
        if (!words.isEmpty()) {
            while (words.size() < 2)
                words += QString{};
            ConfigNode &current{*open.back()};
            if (c == QLatin1Char{';'}) {
                const bool isDeclaration{words.contains(QStringLiteral("range"), Qt::CaseInsensitive) ||
                                         words.contains(QStringLiteral("subclass"), Qt::CaseInsensitive) ||
                                         words.contains(QStringLiteral("fixed-address"), Qt::CaseInsensitive)};
                (isDeclaration ? current.declarations : current.parameters).push_back({words, {}, {}});
            } else if (c == QLatin1Char{'{'}) {
                current.declarations.push_back({words, {}, {}});
                open.push_back(&current.declarations.back());
            }
        }
        if (c == QLatin1Char{'}'} && open.size() > 1)
            open.pop_back();
        words.clear();
    }
    return allNetwork;
}

int blockDepth(const ConfigNode &node)
{
    int depth{0};
    for (const ConfigNode &child : node.declarations)
        depth = std::max(depth, 1 + blockDepth(child));
    return depth;
}
