// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigstatement.h"

/// A statement without children.
class DhcpdConfigParam final : public DhcpdConfigStatement
{
public:
    DhcpdConfigParam(const QStringList &words, DhcpdConfigDeclaration *parent);
    DhcpdConfigParam(const WordList::Buffer &words, DhcpdConfigDeclaration *parent);

    void removeChild(DhcpdConfigStatement *statement) override;
    bool removeChildren(int row, int count) override;
    DhcpdConfigStatement *child(int row) const override;
    int childCount() const override { return 0; }
    int row() const override;
    bool isParam() const override { return true; }
    bool isDeclaration() const override { return false; }
    QString label() const override;
    QString valueText() const override;
};
