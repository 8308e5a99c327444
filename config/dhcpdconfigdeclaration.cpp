// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigdeclaration.h"

#include "config/bracelesskeywords.h"

#include <algorithm>
#include <utility>

namespace {

// What fits into the smallest block of memory that there is: most blocks have few statements.
constexpr std::size_t firstCapacity{3};

} // namespace

DhcpdConfigDeclaration::DhcpdConfigDeclaration(const QStringList &words, DhcpdConfigDeclaration *parent)
    : DhcpdConfigStatement{WordList::Buffer{words}, parent}
{
}

DhcpdConfigDeclaration::DhcpdConfigDeclaration(const WordList::Buffer &words, DhcpdConfigDeclaration *parent)
    : DhcpdConfigStatement{words, parent}
{
}

const DhcpdConfigDeclaration::Parameters &DhcpdConfigDeclaration::parameters() const
{
    static const Parameters none;
    return m_children ? m_children->parameters : none;
}

const DhcpdConfigDeclaration::Declarations &DhcpdConfigDeclaration::declarations() const
{
    static const Declarations none;
    return m_children ? m_children->declarations : none;
}

DhcpdConfigParam *DhcpdConfigDeclaration::addParam(std::unique_ptr<DhcpdConfigParam> param)
{
    return append(makeChildren().parameters, std::move(param));
}

DhcpdConfigDeclaration *DhcpdConfigDeclaration::addDeclaration(std::unique_ptr<DhcpdConfigDeclaration> declaration)
{
    return append(makeChildren().declarations, std::move(declaration));
}

DhcpdConfigParam *DhcpdConfigDeclaration::addParam(const QStringList &words)
{
    return addParam(std::make_unique<DhcpdConfigParam>(words, this));
}

DhcpdConfigDeclaration *DhcpdConfigDeclaration::addDeclaration(const QStringList &words)
{
    return addDeclaration(std::make_unique<DhcpdConfigDeclaration>(words, this));
}

bool DhcpdConfigDeclaration::isOneLine() const
{
    return isBracelessKeyword(words().at(0)) && !(isBraced() && childCount() > 0);
}

void DhcpdConfigDeclaration::removeChild(DhcpdConfigStatement *statement)
{
    const bool found{m_children && (eraseFound(m_children->parameters, statement) ||
                                    eraseFound(m_children->declarations, statement))};
    if (!found)
        delete statement; // deliberate: the caller gives the statement up in any case
}

bool DhcpdConfigDeclaration::removeChildren(int row, int count)
{
    if (row < 0 || qint64{row} + count > childCount())
        return false;
    if (count < 1)
        return true;
    const int firstDeclaration{parameterCount()};
    const int parametersRemoved{std::clamp(firstDeclaration - row, 0, count)};
    const int declarationRow{std::max(0, row - firstDeclaration)};
    erase(m_children->parameters, row, parametersRemoved);
    erase(m_children->declarations, declarationRow, count - parametersRemoved);
    return true;
}

DhcpdConfigStatement *DhcpdConfigDeclaration::child(int row) const
{
    if (row < 0 || row >= childCount())
        return nullptr;
    const auto index = static_cast<std::size_t>(row);
    if (index < parameters().size())
        return parameters()[index].get();
    return declarations()[index - parameters().size()].get();
}

int DhcpdConfigDeclaration::childCount() const { return parameterCount() + static_cast<int>(declarations().size()); }

int DhcpdConfigDeclaration::row() const { return parent() ? parent()->parameterCount() + indexInList() : 0; }

QString DhcpdConfigDeclaration::label() const
{
    static constexpr struct
    {
        bool (DhcpdConfigStatement::*isKind)() const;
        const char *label;
    } kinds[]{
        {&DhcpdConfigStatement::isSubnet, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Subnet")},
        {&DhcpdConfigStatement::isSharedNetwork, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Shared network")},
        {&DhcpdConfigStatement::isHost, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Host")},
        {&DhcpdConfigStatement::isRange, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Range")},
        {&DhcpdConfigStatement::isFixedAddress, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Fixed address")},
        {&DhcpdConfigStatement::isKeyDeclaration, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Key information")},
        {&DhcpdConfigStatement::isZone, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Zone served by DNS server")},
        {&DhcpdConfigStatement::isGroup, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Group")},
    };
    for (const auto &kind : kinds) {
        if ((this->*kind.isKind)())
            return tr(kind.label);
    }
    return keyword();
}

QString DhcpdConfigDeclaration::valueText() const
{
    if (isSubnet())
        return word(1) + QLatin1String{" / "} + word(3);
    if (isRange())
        return word(1) + QLatin1String{" - "} + word(2);
    return joinedWordsFrom(1);
}

DhcpdConfigDeclaration::Children &DhcpdConfigDeclaration::makeChildren()
{
    if (!m_children)
        m_children = std::make_unique<Children>();
    return *m_children;
}

template<class List>
typename List::value_type::pointer DhcpdConfigDeclaration::append(List &list, typename List::value_type child)
{
    Q_ASSERT(child->parent() == this);
    if (list.empty())
        list.reserve(firstCapacity);
    child->m_indexInList = static_cast<int>(list.size());
    list.push_back(std::move(child));
    return list.back().get();
}

template<class List>
void DhcpdConfigDeclaration::erase(List &list, int index, int count)
{
    if (count < 1)
        return;
    const auto first = list.begin() + index;
    auto next = list.erase(first, first + count);
    for (; next != list.end(); ++next, ++index)
        (*next)->m_indexInList = index;
}

template<class List>
bool DhcpdConfigDeclaration::eraseFound(List &list, const DhcpdConfigStatement *statement)
{
    const int index{statement ? statement->m_indexInList : -1};
    if (index < 0 || index >= static_cast<int>(list.size()) || list[static_cast<std::size_t>(index)].get() != statement)
        return false;
    erase(list, index, 1);
    return true;
}
