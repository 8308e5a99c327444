// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leaseparser.h"

#include "common/textencoding.h"

#include <QHostAddress>

#include <algorithm>
#include <array>
#include <utility>

namespace {

using namespace std::string_view_literals;

constexpr std::size_t npos{std::string_view::npos};

constexpr std::array usualStates{"active"sv,   "free"sv,  "expired"sv, "released"sv, "abandoned"sv,
                                 "reserved"sv, "reset"sv, "backup"sv,  "bootp"sv};

bool startsWith(std::string_view text, std::string_view start) { return text.substr(0, start.size()) == start; }
bool contains(std::string_view text, std::string_view part) { return text.find(part) != npos; }

/// The place in `line` of the quote that ends a quoted text beginning at `begin`, or npos. A backslash escapes the
/// character after it.
std::size_t closingQuote(std::string_view line, std::size_t begin)
{
    std::size_t quote{line.find('"', begin)};
    while (quote != npos) {
        std::size_t backslashes{0};
        while (quote - backslashes > begin && line[quote - backslashes - 1] == '\\')
            ++backslashes;
        if (backslashes % 2 == 0)
            break;
        quote = line.find('"', quote + 1);
    }
    return quote;
}

/// The parts of a line that are neither quoted nor a comment. The quotes stay, so that what they separate is not
/// joined.
std::string outsideOfQuotes(std::string_view line)
{
    std::string outside;
    for (std::size_t begin{0}; begin < line.size();) {
        const std::size_t end{line.find_first_of("\"#", begin)};
        outside += line.substr(begin, end - begin);
        if (end == npos || line[end] == '#')
            break;
        outside += '"';
        const std::size_t closing{closingQuote(line, end + 1)};
        begin = closing == npos ? npos : closing + 1;
    }
    return outside;
}

/// The text within the quotes of which the first is at `place`; nothing if there are none.
std::optional<std::string_view> quotedAt(std::string_view line, std::size_t place)
{
    if (place == npos)
        return {};
    std::size_t begin{line.find_first_of("\"#")};
    while (begin < place && line[begin] == '"') {
        const std::size_t closing{closingQuote(line, begin + 1)};
        begin = closing == npos ? npos : line.find_first_of("\"#", closing + 1);
    }
    if (begin != place || line[begin] != '"')
        return {};
    const std::size_t closing{closingQuote(line, begin + 1)};
    if (closing == npos)
        return {};
    return line.substr(begin + 1, closing - begin - 1);
}

/// Where word `index` of a line split at single spaces begins, or npos.
std::size_t wordPlace(std::string_view line, int index)
{
    std::size_t begin{0};
    for (; index > 0; --index) {
        const std::size_t space{line.find(' ', begin)};
        if (space == npos)
            return npos;
        begin = space + 1;
    }
    return begin;
}

/// Word `index` of a line split at single spaces, empty if the line has fewer.
std::string_view word(std::string_view line, int index)
{
    const std::size_t begin{wordPlace(line, index)};
    return begin == npos ? std::string_view{} : line.substr(begin, line.find(' ', begin) - begin);
}

/// A word without its `first` first and `last` last characters.
std::string withoutEnds(std::string_view word, int first, int last)
{
    const bool isAscii{std::all_of(word.begin(), word.end(), [](char c) { return static_cast<signed char>(c) >= 0; })};
    if (isAscii) {
        const std::string_view rest{word.substr(std::min(word.size(), static_cast<std::size_t>(first)))};
        return std::string{rest.substr(0, rest.size() - std::min(rest.size(), static_cast<std::size_t>(last)))};
    }
    const QByteArray bytes{leaseBytes(word)};
    const TextEncoding encoding{TextEncoding::detect(bytes)};
    QString text{encoding.decode(bytes).mid(first)};
    text.chop(last);
    return encoding.encode(text).toStdString();
}

std::string withoutLast(std::string_view word) { return withoutEnds(word, 0, 1); }

LeaseTime timeOf(std::string_view line) { return LeaseTime::parse(word(line, 4), withoutLast(word(line, 5))); }

/// The number of an address of four plain decimal numbers; nothing for every other text.
std::optional<quint32> plainAddress(std::string_view text)
{
    quint32 address{0};
    const char *c{text.data()};
    const char *end{c + text.size()};
    for (int part{0}; part < 4; ++part) {
        if (part > 0 && (c == end || *c++ != '.'))
            return {};
        const char *begin{c};
        quint32 value{0};
        while (c != end && *c >= '0' && *c <= '9' && c - begin < 3)
            value = value * 10 + static_cast<quint32>(*c++ - '0');
        if (c == begin || value > 255 || (*begin == '0' && c - begin > 1)) // a number that begins with 0 is octal
            return {};
        address = address << 8U | value;
    }
    return c == end ? std::optional{address} : std::nullopt;
}

/// The time in a line of a keyword with its indentation, a weekday, a time of the usual layout and a semicolon; else
/// null. `keyword` ends with a space.
const char *usualTime(std::string_view line, std::string_view keyword)
{
    const std::size_t time{keyword.size() + 2};
    const bool isUsual{line.size() == time + LeaseTime::usualLength + 1 && startsWith(line, keyword) &&
                       line[time - 2] >= '0' && line[time - 2] <= '9' && line[time - 1] == ' ' &&
                       LeaseTime::hasUsualLayout(line.data() + time) && line.back() == ';'};
    return isUsual ? line.data() + time : nullptr;
}

/// The state in a line of a keyword with its indentation, one of the usual states and a semicolon; else empty.
std::string_view usualState(std::string_view line, std::string_view keyword)
{
    if (!startsWith(line, keyword) || line.back() != ';')
        return {};
    const std::string_view state{line.substr(keyword.size(), line.size() - keyword.size() - 1)};
    const auto usual = std::find(usualStates.begin(), usualStates.end(), state);
    return usual != usualStates.end() ? *usual : std::string_view{};
}

/// The quoted text in a line of a keyword with its indentation, that text and a semicolon; else nothing. `keyword` ends
/// with the opening quote.
std::optional<std::string_view> usualQuoted(std::string_view line, std::string_view keyword)
{
    if (line.size() < keyword.size() + 2 || !startsWith(line, keyword) || line.back() != ';' ||
        closingQuote(line, keyword.size()) != line.size() - 2)
        return {};
    return line.substr(keyword.size(), line.size() - 2 - keyword.size());
}

/// The address in a line of the word lease, a plain address and an opening brace; else nothing.
std::optional<quint32> usualAddress(std::string_view line)
{
    constexpr std::string_view begin{"lease "};
    constexpr std::string_view end{" {"};
    if (line.size() < begin.size() + end.size() || !startsWith(line, begin) ||
        line.substr(line.size() - end.size()) != end)
        return {};
    return plainAddress(line.substr(begin.size(), line.size() - end.size() - begin.size()));
}

} // namespace

LeaseParser::LeaseParser(LeaseTable &table)
    : m_table{table}
{
    clear();
}

void LeaseParser::clear()
{
    m_values = {};
    m_values.addressText = QString{};
    m_unfinished.clear();
    m_beforeUnfinished.reset();
    m_blockEnded = false;
    m_usualStates.assign(usualStates.size(), {});
    m_table.clear();
}

void LeaseParser::feed(std::string_view bytes)
{
    if (m_beforeUnfinished)
        m_values = *std::exchange(m_beforeUnfinished, std::nullopt);
    if (contains(bytes, "\r"sv)) { // as in any text file, carriage returns are no part of the text
        std::string text{bytes};
        text.erase(std::remove(text.begin(), text.end(), '\r'), text.end());
        feedLines(text);
    } else {
        feedLines(bytes);
    }
}

void LeaseParser::finish()
{
    if (m_beforeUnfinished) // the line was taken, and nothing was fed since
        return;
    m_beforeUnfinished = m_values;
    m_blockEnded = false;
    readLine(m_unfinished);
}

void LeaseParser::feedLines(std::string_view bytes)
{
    std::size_t begin{0};
    if (!m_unfinished.empty()) {
        const std::size_t end{bytes.find('\n')};
        m_unfinished += bytes.substr(0, end);
        if (end == npos)
            return;
        readLine(m_unfinished);
        begin = end + 1;
    }
    for (std::size_t end{}; (end = bytes.find('\n', begin)) != npos; begin = end + 1)
        readLine(bytes.substr(begin, end - begin));
    m_unfinished = bytes.substr(begin);
}

void LeaseParser::readLine(std::string_view line)
{
    if (!readUsualLine(line))
        readAnyLine(line);
}

/// Reads a line that is wholly of a layout that the server writes. Each layout leaves no room for a keyword or brace
/// that would make readAnyLine() take the line for something else; in all others the answer is false.
bool LeaseParser::readUsualLine(std::string_view line)
{
    if (line.size() < 3) {
        if (line == "}"sv)
            endBlock();
        return line.empty() || line == "}"sv;
    }
    switch (line[2]) {
    case 's':
        return readUsualTime(line, "  starts "sv, m_values.lease.start);
    case 'e':
        return readUsualTime(line, "  ends "sv, m_values.lease.end);
    case 'c':
        if (const std::optional<std::string_view> host{usualQuoted(line, R"(  client-hostname ")"sv)}) {
            m_values.lease.host = add(*host);
            return true;
        }
        return usualTime(line, "  cltt "sv);
    case 'b':
        if (const std::string_view state{usualState(line, "  binding state "sv)}; !state.empty()) {
            setState(state);
            return true;
        }
        return false;
    case 'h':
        if (startsWith(line, "  hardware "sv) && !contains(line, "{"sv)) {
            const std::string_view mac{word(line, 4)};
            if (!mac.empty() && mac.back() == ';') {
                m_values.lease.mac = add(mac.substr(0, mac.size() - 1));
                return true;
            }
        }
        return false;
    case 'a':
        if (const std::optional<quint32> address{usualAddress(line)}) {
            m_values.lease.address = *address;
            m_values.addressText.reset();
            return true;
        }
        return usualTime(line, "  atsfp "sv);
    case 't':
        return usualTime(line, "  tstp "sv) || usualTime(line, "  tsfp "sv);
    case 'n':
        return !usualState(line, "  next binding state "sv).empty();
    case 'r':
        return !usualState(line, "  rewind binding state "sv).empty();
    case 'u':
        return usualQuoted(line, R"(  uid ")"sv).has_value();
    default:
        return false;
    }
}

bool LeaseParser::readUsualTime(std::string_view line, std::string_view keyword, LeaseTime &time)
{
    const char *text{usualTime(line, keyword)};
    if (text)
        time = LeaseTime::fromUsualLayout(text);
    return text;
}

void LeaseParser::readAnyLine(std::string_view line)
{
    const std::string outside{outsideOfQuotes(line)};
    const auto has = [&outside](std::string_view keyword) { return contains(outside, keyword); };
    if (has("{"sv)) {
        startBlock(word(line, 1));
    } else if (has("hardware"sv)) {
        m_values.lease.mac = add(withoutLast(word(line, 4)));
    } else if (has("client-hostname"sv)) {
        const std::optional<std::string_view> quoted{quotedAt(line, wordPlace(line, 3))};
        m_values.lease.host = quoted ? add(*quoted) : add(withoutEnds(word(line, 3), 1, 2));
    } else if (has("binding state"sv) && !has("next"sv) && !has("rewind"sv)) {
        setState(withoutLast(word(line, 4)));
    } else if (has("starts"sv)) {
        m_values.lease.start = timeOf(line);
    } else if (has("ends"sv)) {
        m_values.lease.end = timeOf(line);
    } else if (has("}"sv)) {
        endBlock();
    }
}

void LeaseParser::startBlock(std::string_view address)
{
    const QHostAddress parsed{decodeLeaseText(address)};
    const QString shown{parsed.toString()};
    const quint32 number{parsed.toIPv4Address()};
    m_values.lease.address = number;
    m_values.addressText.reset();
    if (shown != QHostAddress{number}.toString())
        m_values.addressText = shown;
}

void LeaseParser::endBlock()
{
    m_blockEnded = true;
    m_table.add(m_values.lease, m_values.addressText);
}

void LeaseParser::setState(std::string_view state)
{
    const auto usual = std::find(usualStates.begin(), usualStates.end(), state);
    if (usual == usualStates.end()) {
        m_values.lease.state = add(state);
        return;
    }
    LeaseTexts::Id &id{m_usualStates[static_cast<std::size_t>(usual - usualStates.begin())]};
    if (id == LeaseTexts::Id{})
        id = add(state);
    m_values.lease.state = id;
}
