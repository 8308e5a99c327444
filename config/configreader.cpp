// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/configreader.h"

#include "config/bracelesskeywords.h"

#include <algorithm>
#include <array>
#include <optional>
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

/// The place from `place` on where something else than an ordinary byte stands; the end of the text or behind it when
/// there is none.
std::size_t nextSpecial(std::string_view text, std::size_t place)
{
    while (place < text.size() && kindOf(text[place]) == Kind::Ordinary)
        ++place;
    return place;
}

/// Follows the quoted texts as the server sees them, where the reader sees words, and notes what it changes in them.
class LossWatcher final
{
public:
    explicit LossWatcher(std::string_view text)
        : m_text{text}
    {
    }

    void seeComment() { ++m_comments; }
    /// Returns whether a quoted text is open from there on.
    bool seeQuote(std::size_t place);
    /// A blank, delimiter or comment sign within a quoted text.
    void seeInQuotes(std::size_t place);
    /// A statement that the server does not take for a block becomes one because of the word at `place`.
    void seeStrayKeyword(std::size_t place, bool isQuoted) { note(isQuoted ? m_quotedTexts : m_statements, place); }
    /// Whether a quoted text is open.
    bool isQuoted() const { return m_opening != std::string_view::npos; }

    ReadingLosses losses() const;

private:
    using Places = std::vector<std::size_t>; // each in the text

    bool isEscaped(std::size_t quote) const;
    static void note(Places &places, std::size_t place);
    std::vector<int> linesOf(Places places) const;

    std::string_view m_text;
    std::size_t m_opening{std::string_view::npos}; // of the quoted text that is open
    bool m_isChanged{};                            // whether the reader changes that
    int m_comments{};
    Places m_quotedTexts;
    Places m_statements;
};

bool LossWatcher::seeQuote(std::size_t place)
{
    if (!isQuoted()) {
        m_opening = place;
        m_isChanged = false;
        return true;
    }
    if (m_text[place - 1] == '\\' && isEscaped(place)) {
        m_isChanged = true; // the reader takes it for the end
        return true;
    }
    if (m_isChanged)
        note(m_quotedTexts, m_opening);
    m_opening = std::string_view::npos;
    return false;
}

void LossWatcher::seeInQuotes(std::size_t place)
{
    const char c{m_text[place]};
    m_isChanged = m_isChanged || (c != '#' && (c != ' ' || m_text[place - 1] == ' '));
}

ReadingLosses LossWatcher::losses() const
{
    Places carriageReturns;
    for (auto place = m_text.find('\r'); place != std::string_view::npos; place = m_text.find('\r', place + 1))
        carriageReturns.push_back(place);
    return {m_comments, linesOf(m_quotedTexts), linesOf(m_statements), linesOf(std::move(carriageReturns))};
}

bool LossWatcher::isEscaped(std::size_t quote) const
{
    const std::size_t last{m_text.find_last_not_of('\\', quote - 1)};
    return (quote - last) % 2 == 0;
}

void LossWatcher::note(Places &places, std::size_t place)
{
    if (places.empty() || places.back() != place)
        places.push_back(place);
}

/// The numbers of the lines that hold the places, each once.
std::vector<int> LossWatcher::linesOf(Places places) const
{
    std::sort(places.begin(), places.end());
    std::vector<int> lines;
    int line{1};
    std::size_t counted{0};
    for (const std::size_t place : places) {
        const std::string_view between{m_text.substr(counted, place - counted)};
        line += static_cast<int>(std::count(between.begin(), between.end(), '\n'));
        counted = place;
        if (lines.empty() || lines.back() != line)
            lines.push_back(line);
    }
    return lines;
}

class Reader final
{
public:
    Reader(std::string_view text, DhcpdConfigDeclaration &top);

    /// False when blocks are nested too deep.
    bool read();
    std::unique_ptr<DhcpdConfigDeclaration> takeTree() { return std::move(m_allNetwork); }
    ReadingLosses losses() const { return m_losses.losses(); }

private:
    struct StrayKeyword
    {
        std::size_t place;
        bool isQuoted;
    };

    void endWord(std::size_t begin, std::size_t end);
    bool endStatement(Kind delimiter);
    const WordList::Buffer &completeWords();
    void clearWords();
    void closeBlock();

    std::string_view m_text;
    LossWatcher m_losses;
    std::unique_ptr<DhcpdConfigDeclaration> m_allNetwork;
    DhcpdConfigDeclaration *m_current;          // the block that is open
    WordList::Buffer m_words;                   // of the statement that is being read
    bool m_hasDeclarationKeyword{};             // whether one of those words makes it a declaration
    std::optional<StrayKeyword> m_strayKeyword; // where that is not the first one
};

Reader::Reader(std::string_view text, DhcpdConfigDeclaration &top)
    : m_text{text}
    , m_losses{text}
    , m_allNetwork{std::make_unique<DhcpdConfigDeclaration>(
          QStringList{DhcpdConfigStatement::tr("All network"), QString{}}, &top)}
    , m_current{m_allNetwork.get()}
{
}

bool Reader::read()
{
    bool quoted{};
    bool isQuotedToServer{};
    std::size_t wordStart{};
    for (std::size_t i{nextSpecial(m_text, 0)}; i < m_text.size(); i = nextSpecial(m_text, i + 1)) {
        const Kind kind{kindOf(m_text[i])};
        if (kind == Kind::Quote) {
            quoted = !quoted;
            isQuotedToServer = m_losses.seeQuote(i);
            continue;
        }
        if (isQuotedToServer)
            m_losses.seeInQuotes(i);
        if (kind == Kind::Hash && quoted)
            continue;

        // Quotes matter to the start of a comment only: blanks and delimiters end a quoted word as well, deliberately.
        endWord(wordStart, i);
        if (kind == Kind::Hash) {
            m_losses.seeComment();
            i = std::min(m_text.find('\n', i), m_text.size());
        } else if (kind != Kind::Blank && !endStatement(kind)) {
            return false;
        }
        wordStart = i + 1;
    }
    return true; // what was not ended by a delimiter is dropped
}

void Reader::endWord(std::size_t begin, std::size_t end)
{
    if (begin == end)
        return;
    const std::string_view word{m_text.substr(begin, end - begin)};
    m_words.add(word);
    if (!m_hasDeclarationKeyword && isBracelessKeyword(word)) {
        m_hasDeclarationKeyword = true;
        if (m_words.count() > 1)
            m_strayKeyword = StrayKeyword{begin, m_losses.isQuoted()};
    }
}

bool Reader::endStatement(Kind delimiter)
{
    const bool isDeclaration{m_hasDeclarationKeyword || delimiter == Kind::OpeningBrace};
    if (delimiter == Kind::ClosingBrace) {
        closeBlock(); // what words stand before it make no statement, deliberately
    } else if (m_words.count() == 0) {
        return true;
    } else if (isDeclaration) {
        if (m_strayKeyword && delimiter == Kind::Semicolon)
            m_losses.seeStrayKeyword(m_strayKeyword->place, m_strayKeyword->isQuoted);
        auto *declaration =
            m_current->addDeclaration(std::make_unique<DhcpdConfigDeclaration>(completeWords(), m_current));
        if (delimiter == Kind::OpeningBrace) {
            declaration->setBraced();
            m_current = declaration;
        }
    } else {
        m_current->addParam(std::make_unique<DhcpdConfigParam>(completeWords(), m_current));
    }
    clearWords();
    return m_current->depth() < maximumBlockDepth;
}

const WordList::Buffer &Reader::completeWords()
{
    m_words.addEmpty(std::max(0, 2 - m_words.count())); // a statement has two words at least
    return m_words;
}

void Reader::clearWords()
{
    m_words.clear();
    if (m_hasDeclarationKeyword)
        m_strayKeyword.reset();
    m_hasDeclarationKeyword = false;
}

void Reader::closeBlock()
{
    if (!m_current->isRoot())
        m_current = m_current->parent();
}

} // namespace

std::unique_ptr<DhcpdConfigDeclaration> readConfiguration(std::string_view text, DhcpdConfigDeclaration &top,
                                                          ReadingLosses *losses)
{
    Reader reader{text, top};
    if (!reader.read())
        return nullptr;
    if (losses)
        *losses = reader.losses();
    return reader.takeTree();
}
