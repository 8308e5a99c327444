// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigdeclaration.h"

#include <QMetaType>
#include <QString>
#include <QStringList>

#include <vector>

/// A statement and everything below it as plain values, for comparing trees.
struct ConfigNode
{
    QStringList words;
    std::vector<ConfigNode> parameters{};
    std::vector<ConfigNode> declarations{};

    bool operator==(const ConfigNode &other) const;
};

/// Also used by QCOMPARE: one line for each statement, each word between angle brackets.
QString toText(const ConfigNode &node);
char *toString(const ConfigNode &node);

ConfigNode nodeOf(const DhcpdConfigStatement &statement);

/// Adds the children of `node` as statements to `declaration`.
void addChildren(DhcpdConfigDeclaration &declaration, const ConfigNode &node);

/// A declaration that stands for the invisible top node.
std::unique_ptr<DhcpdConfigDeclaration> makeTop();

/// The "All network" node of `text` under `top`; null when it was refused.
DhcpdConfigDeclaration *readUnder(DhcpdConfigDeclaration &top, const QString &text);

Q_DECLARE_METATYPE(ConfigNode)
