// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/referencereader.h"

#include <algorithm>

namespace {

bool isOneOf(QChar c, const char *characters) { return QString::fromLatin1(characters).contains(c); }

bool holdsAnyCase(const QStringList &words, const char *word)
{
    return words.contains(QString::fromLatin1(word), Qt::CaseInsensitive);
}

// Adds the statement of `words` to the innermost open block.
void endStatement(std::vector<ConfigNode *> &open, QStringList words, QChar delimiter)
{
    while (words.size() == 1)
        words += QString{};
    ConfigNode &current{*open.back()};
    if (!words.isEmpty() && delimiter == QLatin1Char{';'}) {
        const bool isDeclaration{holdsAnyCase(words, "range") || holdsAnyCase(words, "subclass") ||
                                 holdsAnyCase(words, "fixed-address")};
        (isDeclaration ? current.declarations : current.parameters).push_back({words});
    } else if (!words.isEmpty() && delimiter == QLatin1Char{'{'}) {
        current.declarations.push_back({words});
        open.push_back(&current.declarations.back());
    } else if (delimiter == QLatin1Char{'}'} && open.size() > 1) {
        open.pop_back();
    }
}

} // namespace

ConfigNode readByReference(const QString &text)
{
    ConfigNode allNetwork{{QStringLiteral("All network"), QString{}}};
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
        if (!isOneOf(c, "\t\n ;{}")) {
            word += c;
            continue;
        }
        if (!word.isEmpty())
            words += word;
        word.clear();
        if (isOneOf(c, ";{}")) {
            endStatement(open, words, c);
            words.clear();
        }
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
