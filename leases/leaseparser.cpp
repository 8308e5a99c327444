// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leaseparser.h"

#include "common/textencoding.h"

#include <QHostAddress>

#include <algorithm>
#include <array>
#include <cstring>
#include <utility>

namespace {

using namespace std::string_view_literals;

constexpr std::size_t npos{std::string_view::npos};

constexpr std::array usualStates{"active"sv,   "free"sv,  "expired"sv, "released"sv, "abandoned"sv,
                                 "reserved"sv, "reset"sv, "backup"sv,  "bootp"sv};

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

/// The place of the next quote or sign of a comment, or npos.
std::size_t quoteOrComment(std::string_view line, std::size_t begin)
{
    const auto *place = std::find_if(line.begin() + begin, line.end(), [](char c) { return c == '"' || c == '#'; });
    return place == line.end() ? npos : static_cast<std::size_t>(place - line.begin());
}

/// What a line is taken for.
enum class Meaning
{
    None,
    BlockStart,
    Hardware,
    HostName,
    State,
    Start,
    End,
    BlockEnd
};

/// What a line means by those of its parts that are outside of quotes and comments.
Meaning meaningOf(std::string_view outside)
{
    const auto has = [outside](std::string_view keyword) { return contains(outside, keyword); };
    if (has("{"sv))
        return Meaning::BlockStart;
    if (has("hardware"sv))
        return Meaning::Hardware;
    if (has("client-hostname"sv))
        return Meaning::HostName;
    if (has("binding state"sv) && !has("next"sv) && !has("rewind"sv))
        return Meaning::State;
    if (has("starts"sv))
        return Meaning::Start;
    if (has("ends"sv))
        return Meaning::End;
    return has("}"sv) ? Meaning::BlockEnd : Meaning::None;
}

/// The parts of a line that are neither quoted nor a comment. The quotes stay, so that what they separate is not
/// joined.
std::string outsideOfQuotes(std::string_view line)
{
    std::string outside;
    for (std::size_t begin{0}; begin < line.size();) {
        const std::size_t end{quoteOrComment(line, begin)};
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
    std::size_t begin{quoteOrComment(line, 0)};
    while (begin < place && line[begin] == '"') {
        const std::size_t closing{closingQuote(line, begin + 1)};
        begin = closing == npos ? npos : quoteOrComment(line, closing + 1);
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

// The functions below look for a line of one layout at `line`, from where there are at least mostOfUsual bytes, and say
// where the line after it begins, or null.
constexpr std::ptrdiff_t mostOfUsual{64};

// More variables and options than a server's configuration has.
constexpr std::size_t mostHarmless{16};

template<std::size_t size>
bool startsWith(const char *line, const char (&start)[size])
{
    return std::memcmp(line, start, size - 1) == 0;
}

template<std::size_t size>
const char *after(const char *line, const char (&start)[size])
{
    return startsWith(line, start) ? line + size - 1 : nullptr;
}

bool isDigit(char c) { return c >= '0' && c <= '9'; }
bool isHexDigit(char c) { return isDigit(c) || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F'); }
bool isHexDigitOrColon(char c) { return isHexDigit(c) || c == ':'; }

/// The word lease, an address of four plain decimal numbers and an opening brace.
const char *usualAddress(const char *line, quint32 &address)
{
    const char *c{after(line, "lease ")};
    if (!c)
        return nullptr;
    quint32 number{0};
    for (int part{0}; part < 4; ++part) {
        if (part > 0 && *c++ != '.')
            return nullptr;
        const char *begin{c};
        quint32 value{0};
        while (isDigit(*c) && c - begin < 3)
            value = value * 10 + static_cast<quint32>(*c++ - '0');
        if (c == begin || value > 255 || (*begin == '0' && c - begin > 1)) // a number that begins with 0 is octal
            return nullptr;
        number = number << 8U | value;
    }
    const char *next{after(c, " {\n")};
    if (next)
        address = number;
    return next;
}

/// A keyword with its indentation and a space, a weekday, a time of the usual layout and a semicolon.
template<std::size_t size>
const char *usualTime(const char *line, const char (&keyword)[size])
{
    const char *day{after(line, keyword)};
    if (!day || !isDigit(day[0]) || day[1] != ' ' || !LeaseTime::hasUsualLayout(day + 2))
        return nullptr;
    return after(day + 2 + LeaseTime::usualLength, ";\n");
}

template<std::size_t size>
const char *usualTime(const char *line, const char (&keyword)[size], LeaseTime &time)
{
    const char *next{usualTime(line, keyword)};
    if (next)
        time = LeaseTime::fromUsualLayout(line + size - 1 + 2);
    return next;
}

/// A keyword with its indentation and a space, one of the usual states and a semicolon.
template<std::size_t size>
const char *usualState(const char *line, const char (&keyword)[size], std::size_t &state)
{
    const char *begin{after(line, keyword)};
    if (!begin)
        return nullptr;
    for (state = 0; state < usualStates.size(); ++state) {
        const std::string_view usual{usualStates[state]};
        if (*begin == usual.front() && std::memcmp(begin, usual.data(), usual.size()) == 0)
            return after(begin + usual.size(), ";\n");
    }
    return nullptr;
}

/// The hardware address of an Ethernet card.
const char *usualHardware(const char *line, std::string_view &address)
{
    constexpr std::size_t length{17};
    const char *begin{after(line, "  hardware ethernet ")};
    if (!begin)
        return nullptr;
    for (std::size_t i{0}; i < length; ++i) {
        if (i % 3 == 2 ? begin[i] != ':' : !isHexDigit(begin[i]))
            return nullptr;
    }
    address = {begin, length};
    return after(begin + length, ";\n");
}

/// A keyword with its indentation, a quoted text, of which `keyword` has the first quote, and a semicolon.
template<std::size_t size>
const char *usualQuoted(const char *line, const char *end, const char (&keyword)[size], std::string_view &text)
{
    const char *begin{after(line, keyword)};
    if (!begin)
        return nullptr;
    const std::string_view rest{begin, static_cast<std::size_t>(end - begin)};
    const std::size_t lineFeed{rest.find('\n')};
    if (lineFeed == npos || lineFeed < 2 || rest[lineFeed - 1] != ';')
        return nullptr;
    text = rest.substr(0, lineFeed - 2);
    return closingQuote(rest.substr(0, lineFeed), 0) == text.size() ? begin + lineFeed + 1 : nullptr;
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
    m_values.addressText.emplace();
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
    const char *end{bytes.data() + bytes.size()};
    const char *line{bytes.data() + begin};
    while (line != end) {
        const char *next{end - line >= mostOfUsual ? readUsualLine(line, end) : nullptr};
        if (!next) {
            const auto *lineFeed =
                static_cast<const char *>(std::memchr(line, '\n', static_cast<std::size_t>(end - line)));
            if (!lineFeed)
                break;
            readLine({line, static_cast<std::size_t>(lineFeed - line)});
            next = lineFeed + 1;
        }
        line = next;
    }
    m_unfinished.assign(line, end);
}

/// Reads the line at `line` if it is wholly of a layout that the server writes, and returns the line after it, else
/// null. Each layout leaves no room for a keyword or brace that would make readLine() take the line for something else.
const char *LeaseParser::readUsualLine(const char *line, const char *end)
{
    const char *next{};
    std::string_view text;
    std::size_t state{};
    switch (line[2]) {
    case 's':
        next = usualTime(line, "  starts ", m_values.lease.start);
        return next ? next : afterSetting(line, end);
    case 'e':
        return usualTime(line, "  ends ", m_values.lease.end);
    case 'c':
        next = usualQuoted(line, end, R"(  client-hostname ")", text);
        if (next)
            setHost(text);
        return next ? next : usualTime(line, "  cltt ");
    case 'b':
        next = usualState(line, "  binding state ", state);
        if (next)
            setUsualState(state);
        return next;
    case 'h':
        next = usualHardware(line, text);
        if (next)
            setMac(text);
        return next;
    case 'a':
        next = usualAddress(line, m_values.lease.address);
        if (next)
            m_values.addressText.reset();
        return next ? next : usualTime(line, "  atsfp ");
    case 't':
        next = usualTime(line, "  tstp ");
        return next ? next : usualTime(line, "  tsfp ");
    case 'n':
        return usualState(line, "  next binding state ", state);
    case 'o':
        return afterSetting(line, end);
    case 'r':
        return usualState(line, "  rewind binding state ", state);
    case 'u':
        return usualQuoted(line, end, R"(  uid ")", text);
    default:
        next = after(line, "}\n");
        if (next)
            endBlock();
        return next;
    }
}

/// The line after one that sets a variable or states an option, or null; such a line means nothing here.
const char *LeaseParser::afterSetting(const char *begin, const char *end)
{
    if (!startsWith(begin, "  set ") && !startsWith(begin, "  option "))
        return nullptr;
    const std::string_view rest{begin, static_cast<std::size_t>(end - begin)};
    const std::size_t lineFeed{rest.find('\n')};
    if (lineFeed == npos || rest[lineFeed - 1] != ';')
        return nullptr;
    const std::string_view line{rest.substr(0, lineFeed - 1)};
    const std::size_t quote{line.find('"')};
    const std::size_t value{quote != npos ? quote : line.rfind(' ')};
    const bool isPlainValue{quote != npos ? closingQuote(line, quote + 1) == line.size() - 1
                                          : std::all_of(line.begin() + value + 1, line.end(), isHexDigitOrColon)};
    return isPlainValue && isHarmless(line.substr(0, value)) ? line.data() + lineFeed + 1 : nullptr;
}

/// Whether a line means nothing by what comes before its value.
bool LeaseParser::isHarmless(std::string_view beginning)
{
    if (std::find(m_harmless.begin(), m_harmless.end(), beginning) != m_harmless.end())
        return true;
    if (meaningOf(beginning) != Meaning::None)
        return false;
    if (m_harmless.size() == mostHarmless)
        m_harmless.clear();
    m_harmless.emplace_back(beginning);
    return true;
}

void LeaseParser::readLine(std::string_view line)
{
    switch (meaningOf(outsideOfQuotes(line))) {
    case Meaning::None:
        break;
    case Meaning::BlockStart:
        startBlock(word(line, 1));
        break;
    case Meaning::Hardware:
        setMac(withoutLast(word(line, 4)));
        break;
    case Meaning::HostName: {
        const std::optional<std::string_view> quoted{quotedAt(line, wordPlace(line, 3))};
        setHost(quoted ? std::string{*quoted} : withoutEnds(word(line, 3), 1, 2));
        break;
    }
    case Meaning::State:
        setState(withoutLast(word(line, 4)));
        break;
    case Meaning::Start:
        m_values.lease.start = timeOf(line);
        break;
    case Meaning::End:
        m_values.lease.end = timeOf(line);
        break;
    case Meaning::BlockEnd:
        endBlock();
        break;
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
        m_values.lease.state = m_table.texts(LeaseColumn::State).add(state);
        return;
    }
    setUsualState(static_cast<std::size_t>(usual - usualStates.begin()));
}

void LeaseParser::setUsualState(std::size_t state)
{
    LeaseTexts::Id &id{m_usualStates[state]};
    if (id == LeaseTexts::Id{})
        id = m_table.texts(LeaseColumn::State).add(usualStates[state]);
    m_values.lease.state = id;
}
