// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigparam.h"
#include "config/dhcpdconfigstatement.h"

#include <memory>
#include <vector>

/// The deepest nesting of blocks that a configuration may have: views and the server itself recurse into them.
constexpr int maximumBlockDepth{500};

/// A statement that owns others: parameters, and after them declarations.
class DhcpdConfigDeclaration final : public DhcpdConfigStatement
{
public:
    using Parameters = std::vector<std::unique_ptr<DhcpdConfigParam>>;
    using Declarations = std::vector<std::unique_ptr<DhcpdConfigDeclaration>>;

    DhcpdConfigDeclaration(const QStringList &words, DhcpdConfigDeclaration *parent);
    DhcpdConfigDeclaration(const WordList::Buffer &words, DhcpdConfigDeclaration *parent);

    const Parameters &parameters() const;
    const Declarations &declarations() const;
    /// Appends a statement that was made with this declaration as its parent.
    DhcpdConfigParam *addParam(std::unique_ptr<DhcpdConfigParam> param);
    DhcpdConfigDeclaration *addDeclaration(std::unique_ptr<DhcpdConfigDeclaration> declaration);
    /// Makes a statement of `words` and appends it.
    DhcpdConfigParam *addParam(const QStringList &words);
    DhcpdConfigDeclaration *addDeclaration(const QStringList &words);

    /// Whether the declaration has a body in braces, whatever its keyword is: as it stood in the file, or since an edit
    /// put statements there.
    bool isBraced() const { return m_isBraced; }
    void setBraced() { m_isBraced = true; }
    /// Whether the declaration is written without its children, deliberately, unless those have their braces.
    bool isOneLine() const;
    /// Whether the block that the declaration is with statements in it would not be nested too deep.
    bool takesStatements() const { return depth() < maximumBlockDepth; }
    /// Whether a block in this one would not be.
    bool takesBlocks() const { return depth() + 1 < maximumBlockDepth; }

    void removeChild(DhcpdConfigStatement *statement) override;
    bool removeChildren(int row, int count) override;
    DhcpdConfigStatement *child(int row) const override;
    int childCount() const override;
    int row() const override;
    bool isParam() const override { return false; }
    bool isDeclaration() const override { return true; }
    QString label() const override;
    QString valueText() const override;

private:
    struct Children
    {
        Parameters parameters;
        Declarations declarations;
    };

    int parameterCount() const { return static_cast<int>(parameters().size()); }
    Children &makeChildren();
    template<class List>
    typename List::value_type::pointer append(List &list, typename List::value_type child);
    template<class List>
    static void erase(List &list, int index, int count);
    template<class List>
    static bool eraseFound(List &list, const DhcpdConfigStatement *statement);

    bool m_isBraced{};
    std::unique_ptr<Children> m_children; // null while there were none: most declarations are ranges and addresses
};
