// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/confignode.h"

#include "config/configreader.h"

#include <QTest>

namespace {

void appendText(QString &text, const ConfigNode &node, int depth)
{
    text += QString{depth * 2, QLatin1Char{' '}};
    for (const QString &word : node.words)
        text += QLatin1Char{'<'} + word + QLatin1Char{'>'};
    text += QLatin1Char{'\n'};
    for (const auto *children : {&node.parameters, &node.declarations}) {
        text += QString{depth * 2, QLatin1Char{' '}};
        text += children == &node.parameters ? QLatin1String{"parameters\n"} : QLatin1String{"declarations\n"};
        for (const ConfigNode &child : *children)
            appendText(text, child, depth + 1);
    }
}

} // namespace

bool ConfigNode::operator==(const ConfigNode &other) const
{
    return words == other.words && parameters == other.parameters && declarations == other.declarations;
}

QString toText(const ConfigNode &node)
{
    QString text;
    appendText(text, node, 0);
    return text;
}

char *toString(const ConfigNode &node) { return QTest::toString(toText(node)); }

ConfigNode nodeOf(const DhcpdConfigStatement &statement)
{
    ConfigNode node;
    for (int i{}; i < statement.wordCount(); ++i)
        node.words += statement.word(i);
    for (int row{}; row < statement.childCount(); ++row) {
        const DhcpdConfigStatement &child{*statement.child(row)};
        (child.isParam() ? node.parameters : node.declarations).push_back(nodeOf(child));
    }
    return node;
}

void addChildren(DhcpdConfigDeclaration &declaration, const ConfigNode &node)
{
    for (const ConfigNode &param : node.parameters)
        declaration.addParam(std::make_unique<DhcpdConfigParam>(param.words, &declaration));
    for (const ConfigNode &child : node.declarations) {
        DhcpdConfigDeclaration *added{
            declaration.addDeclaration(std::make_unique<DhcpdConfigDeclaration>(child.words, &declaration))};
        addChildren(*added, child);
    }
}

std::unique_ptr<DhcpdConfigDeclaration> makeTop()
{
    return std::make_unique<DhcpdConfigDeclaration>(QStringList{QStringLiteral("Topology"), QStringLiteral("Value")},
                                                    nullptr);
}

DhcpdConfigDeclaration *readUnder(DhcpdConfigDeclaration &top, const QString &text)
{
    const QByteArray utf8{text.toUtf8()};
    auto tree = readConfiguration({utf8.constData(), static_cast<std::size_t>(utf8.size())}, top);
    return tree ? top.addDeclaration(std::move(tree)) : nullptr;
}
