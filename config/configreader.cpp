// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/configreader.h"

#include <algorithm>
#include <array>
#include <utility>

namespace {

enum class Kind : unsigned char
{
    Ordinary,
    Quote,
    Hash,
    Blank,
    Semicolon,
    OpeningBrace,
    ClosingBrace
};

// What each byte is to the reader. A carriage return is ordinary, deliberately.
constexpr std::array<Kind, 256> kinds{[] {
    std::array<Kind, 256> table{};
    table['"'] = Kind::Quote;
    table['#'] = Kind::Hash;
    table['\t'] = table['\n'] = table[' '] = Kind::Blank;
    table[';'] = Kind::Semicolon;
    table['{'] = Kind::OpeningBrace;
    table['}'] = Kind::ClosingBrace;
    return table;
}()};

Kind kindOf(char c) { return kinds[static_cast<unsigned char>(c)]; }

// Keywords that make a declaration of a statement without a block.
constexpr std::string_view declarationKeywords[]{"range", "subclass", "fixed-address"};

// Whether a word with that first byte may be one of them: most words are told apart by it. Beyond ASCII there are case
// variants of ASCII letters.
constexpr std::array<bool, 256> firstBytes{[] {
    std::array<bool, 256> table{};
    for (const std::string_view keyword : declarationKeywords) {
        constexpr std::size_t caseDistance{'a' - 'A'};
        const std::size_t first{static_cast<unsigned char>(keyword.front())};
        table[first] = table[first - caseDistance] = true;
    }
    for (std::size_t byte{0x80}; byte < table.size(); ++byte)
        table[byte] = true;
    return table;
}()};

bool isDeclarationKeyword(std::string_view word)
{
    return firstBytes[static_cast<unsigned char>(word.front())] &&
           std::any_of(std::begin(declarationKeywords), std::end(declarationKeywords),
                       [word](std::string_view keyword) { return equalsIgnoringCase(word, keyword); });
}

class Reader final
{
public:
    explicit Reader(DhcpdConfigDeclaration &top);

    /// False when blocks are nested too deep.
    bool read(std::string_view text);
    std::unique_ptr<DhcpdConfigDeclaration> takeTree() { return std::move(m_allNetwork); }

private:
    void endWord(std::string_view word);
    bool endStatement(Kind delimiter);
    WordList takeWords();
    void clearWords();
    void closeBlock();

    std::unique_ptr<DhcpdConfigDeclaration> m_allNetwork;
    DhcpdConfigDeclaration *m_current; // the block that is open
    WordList::Buffer m_words;          // of the statement that is being read
    int m_wordCount{};
    bool m_hasDeclarationKeyword{}; // whether one of those words makes it a declaration
};

Reader::Reader(DhcpdConfigDeclaration &top)
    : m_allNetwork{std::make_unique<DhcpdConfigDeclaration>(
          QStringList{DhcpdConfigStatement::tr("All network"), QString{}}, &top)}
    , m_current{m_allNetwork.get()}
{
}

bool Reader::read(std::string_view text)
{
    bool quoted{};
    std::size_t wordStart{};
    for (std::size_t i{}; i < text.size(); ++i) {
        const Kind kind{kindOf(text[i])};
        if (kind == Kind::Ordinary)
            continue;
        if (kind == Kind::Quote) {
            quoted = !quoted;
            continue;
        }
        if (kind == Kind::Hash && quoted)
            continue;

        // Quotes matter to the start of a comment only: blanks and delimiters end a quoted word as well, deliberately.
        endWord(text.substr(wordStart, i - wordStart));
        if (kind == Kind::Hash)
            i = std::min(text.find('\n', i), text.size());
        else if (kind != Kind::Blank && !endStatement(kind))
            return false;
        wordStart = i + 1;
    }
    return true; // what was not ended by a delimiter is dropped
}

void Reader::endWord(std::string_view word)
{
    if (word.empty())
        return;
    m_words.add(word);
    ++m_wordCount;
    m_hasDeclarationKeyword = m_hasDeclarationKeyword || isDeclarationKeyword(word);
}

bool Reader::endStatement(Kind delimiter)
{
    const bool isDeclaration{m_hasDeclarationKeyword || delimiter == Kind::OpeningBrace};
    if (delimiter == Kind::ClosingBrace) {
        clearWords(); // they make no statement before a closing brace, deliberately
        closeBlock();
    } else if (m_wordCount == 0) {
        return true;
    } else if (isDeclaration) {
        auto *declaration = m_current->addDeclaration(std::make_unique<DhcpdConfigDeclaration>(takeWords(), m_current));
        if (delimiter == Kind::OpeningBrace) {
            declaration->setReadAsBlock();
            m_current = declaration;
        }
    } else {
        m_current->addParam(std::make_unique<DhcpdConfigParam>(takeWords(), m_current));
    }
    return m_current->depth() < maximumBlockDepth;
}

WordList Reader::takeWords()
{
    m_words.addEmpty(std::max(0, 2 - m_wordCount)); // a statement has two words at least
    WordList words{m_words};
    clearWords();
    return words;
}

void Reader::clearWords()
{
    m_words.clear();
    m_wordCount = 0;
    m_hasDeclarationKeyword = false;
}

void Reader::closeBlock()
{
    if (!m_current->isRoot())
        m_current = m_current->parent();
}

} // namespace

std::unique_ptr<DhcpdConfigDeclaration> readConfiguration(std::string_view text, DhcpdConfigDeclaration &top)
{
    Reader reader{top};
    return reader.read(text) ? reader.takeTree() : nullptr;
}
