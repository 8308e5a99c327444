// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/wordlist.h"

#include <QCoreApplication>
#include <QString>
#include <QStringList>

class DhcpdConfigDeclaration;

/// One statement of the DHCP server's configuration: its words (word 0 is the keyword, quotes are kept in the words)
/// and its place in the tree.
class DhcpdConfigStatement
{
    Q_DECLARE_TR_FUNCTIONS(DhcpdConfigStatement)

public:
    virtual ~DhcpdConfigStatement() = default;
    Q_DISABLE_COPY_MOVE(DhcpdConfigStatement)

    /// Takes `statement` out of the children and destroys it, also when it is not one of them.
    virtual void removeChild(DhcpdConfigStatement *statement) = 0;
    /// Destroys `count` children from `row` on; false when they are not all there.
    virtual bool removeChildren(int row, int count) = 0;
    /// Inserts `count` empty words; false when `position` lies outside the words.
    virtual bool insertWords(int position, int count);
    /// Removes `count` words; false when they are not all there.
    virtual bool removeWords(int position, int count);
    /// Replaces one word; false when there is none at `index`.
    virtual bool setWord(int index, const QString &text);
    /// The child at `row`, parameters first; null when there is none.
    virtual DhcpdConfigStatement *child(int row) const = 0;
    virtual int childCount() const = 0;
    /// The statement's row among its parent's children, parameters first; 0 without a parent.
    virtual int row() const = 0;
    /// What the statement shows in `column`: its label, its value, and from column 2 on the word of that index.
    virtual QString text(int column) const;
    virtual bool isParam() const = 0;
    virtual bool isDeclaration() const = 0;

    virtual QString label() const = 0;
    virtual QString valueText() const = 0;

    /// The word at `index`; empty when there is none.
    QString word(int index) const { return decodedWord(m_words.at(index)); }
    QString keyword() const { return word(0); }
    int wordCount() const { return m_words.count(); }
    const WordList &words() const { return m_words; }
    /// The words from `position` on.
    QStringList wordsFrom(int position) const;
    /// The words from `position` on as one text, without blanks at its ends: a value may be several words.
    QString textFrom(int position) const { return wordsFrom(position).join(QLatin1Char{' '}).trimmed(); }
    /// All words joined by single spaces.
    QString joinedWords() const { return joinedWordsFrom(0); }
    /// Puts `words` in the place of all words from `position` on; false when there are fewer than `position`.
    bool setWordsFrom(int position, const QStringList &words);

    DhcpdConfigDeclaration *parent() const { return m_parent; }
    void setParent(DhcpdConfigDeclaration *parent);
    /// The level of nesting: 0 for a statement at the top of the file, negative for the nodes above it.
    int depth() const { return m_depth; }
    /// Whether this is a node above the file's statements: the invisible top node or the "All network" node.
    bool isRoot() const { return !m_parent || m_depth < 0; }
    /// The white space that the statement's lines begin with in the file.
    QString indent() const;
    int indentWidth() const; ///< the length of indent()

    bool isOption() const { return wordIs(0, "option"); }
    bool isHardware() const { return wordIs(0, "hardware"); }
    bool isMacAddress() const { return isHardware() && wordIs(1, "ethernet"); }
    bool isKey() const { return wordIs(0, "key"); }
    bool isAlgorithm() const { return wordIs(0, "algorithm"); }
    bool isSecret() const { return wordIs(0, "secret"); }
    bool isPrimary() const { return wordIs(0, "primary"); }
    bool isDefaultLeaseTime() const { return wordIs(0, "default-lease-time"); }
    bool isMaxLeaseTime() const { return wordIs(0, "max-lease-time"); }
    bool isLeaseTime() const { return keyword().contains(QLatin1String{"lease-time"}, Qt::CaseInsensitive); }

    // Kinds of options: for statements that isOption() holds for.
    bool isRouters() const { return wordIs(1, "routers"); }
    bool isDnsServers() const { return wordIs(1, "domain-name-servers"); }
    bool isNtpServers() const { return wordIs(1, "ntp-servers"); }
    bool isDomainName() const { return wordIs(1, "domain-name"); }
    bool isMsStaticRoute() const { return wordIs(1, "ms-classless-static-routes"); }
    bool isStaticRoute() const { return wordIs(1, "classless-static-routes"); }

    bool isSubnet() const { return wordIs(0, "subnet"); }
    bool isSharedNetwork() const { return wordIs(0, "shared-network"); }
    bool isHost() const { return wordIs(0, "host"); }
    bool isRange() const { return wordIs(0, "range"); }
    bool isFixedAddress() const { return wordIs(0, "fixed-address"); }
    bool isSubclass() const { return wordIs(0, "subclass"); }
    bool isKeyDeclaration() const { return wordIs(0, "key"); }
    bool isZone() const { return wordIs(0, "zone"); }
    bool isGroup() const { return wordIs(0, "group"); }

protected:
    /// Does not put the statement among the parent's children: addParam() and addDeclaration() do.
    DhcpdConfigStatement(const WordList::Buffer &words, DhcpdConfigDeclaration *parent);

    /// The words from `position` on, or the last one when they are fewer, joined by single spaces.
    QString joinedWordsFrom(int position) const;
    /// The statement's place in the parent's list that holds it; -1 while it is in none.
    int indexInList() const { return m_indexInList; }

private:
    friend class DhcpdConfigDeclaration; // numbers its children

    bool wordIs(int index, std::string_view literal) const { return equalsIgnoringCase(m_words.at(index), literal); }

    DhcpdConfigDeclaration *m_parent{};
    WordList m_words;
    int m_indexInList{-1};
    qint16 m_depth{}; // small, and last: a declaration's flag fits in behind it
};
