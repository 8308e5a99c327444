// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/textencoding.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <clocale>
#include <cstdint>
#include <cstring>
#include <limits>
#include <numeric>
#include <optional>
#include <string_view>

#include <iconv.h>
#include <langinfo.h>

namespace {

constexpr const char *utf8Charset{"UTF-8"};
constexpr const char *latin1Charset{"ISO-8859-1"};

using Byte = unsigned char;

const Byte *bytesOf(const QByteArray &text) { return reinterpret_cast<const Byte *>(text.constData()); }

const Byte *skipAscii(const Byte *at, const Byte *end)
{
    constexpr std::uint64_t highBits{0x8080808080808080};
    std::uint64_t word{};
    while (end - at >= qptrdiff{sizeof word}) {
        std::memcpy(&word, at, sizeof word);
        if ((word & highBits) != 0)
            break;
        at += sizeof word;
    }
    return std::find_if(at, end, [](Byte byte) { return byte >= 0x80; });
}

bool isAscii(const QByteArray &text)
{
    const Byte *end{bytesOf(text) + text.size()};
    return skipAscii(bytesOf(text), end) == end;
}

// The sequences of more than one byte by their first one, with what may come second: overlong forms, surrogates and
// what lies above U+10FFFF are not in the table.
struct Sequence
{
    Byte first, last;
    Byte secondLeast, secondMost;
    int length;
};

constexpr std::array<Sequence, 8> sequences{{
    {0xC2, 0xDF, 0x80, 0xBF, 2},
    {0xE0, 0xE0, 0xA0, 0xBF, 3},
    {0xE1, 0xEC, 0x80, 0xBF, 3},
    {0xED, 0xED, 0x80, 0x9F, 3},
    {0xEE, 0xEF, 0x80, 0xBF, 3},
    {0xF0, 0xF0, 0x90, 0xBF, 4},
    {0xF1, 0xF3, 0x80, 0xBF, 4},
    {0xF4, 0xF4, 0x80, 0x8F, 4},
}};

// The length of the sequence at `at`, which is not ASCII; 0 when it is not valid.
int sequenceLength(const Byte *at, const Byte *end)
{
    const auto sequence =
        std::find_if(sequences.begin(), sequences.end(), [at](const Sequence &each) { return *at <= each.last; });
    if (sequence == sequences.end() || *at < sequence->first || end - at < sequence->length ||
        at[1] < sequence->secondLeast || at[1] > sequence->secondMost)
        return 0;
    const bool continued{std::all_of(at + 2, at + sequence->length, [](Byte byte) { return (byte & 0xC0U) == 0x80; })};
    return continued ? sequence->length : 0;
}

bool isUtf8(const QByteArray &text)
{
    const Byte *end{bytesOf(text) + text.size()};
    for (const Byte *at{skipAscii(bytesOf(text), end)}; at != end; at = skipAscii(at, end)) {
        const int length{sequenceLength(at, end)};
        if (length == 0)
            return false;
        at += length;
    }
    return true;
}

std::string_view viewOf(const QByteArray &text) { return {text.constData(), static_cast<std::size_t>(text.size())}; }

/// A conversion of texts from one encoding into another by the C library.
class Converter final
{
public:
    Converter(const char *from, const char *to)
        : m_handle{iconv_open(to, from)}
    {
    }
    ~Converter()
    {
        if (isOpen())
            iconv_close(m_handle);
    }
    Q_DISABLE_COPY_MOVE(Converter)

    /// Nothing where the text is not valid, or has a character that the other encoding lacks.
    std::optional<QByteArray> convert(std::string_view text) const
    {
        if (!isOpen())
            return {};
        QByteArray converted;
        converted.reserve(static_cast<int>(text.size()));
        auto at = const_cast<char *>(text.data()); // iconv() does not write there
        std::size_t left{text.size()};
        while (true) {
            const bool isEnd{left == 0};
            std::array<char, 4096> piece{};
            char *end{piece.data()};
            std::size_t space{piece.size()};
            const std::size_t failures{iconv(m_handle, isEnd ? nullptr : &at, &left, &end, &space)};
            const bool isPieceFull{failures == static_cast<std::size_t>(-1) && errno == E2BIG};
            if (failures != 0 && !isPieceFull)
                return {};
            converted.append(piece.data(), static_cast<int>(end - piece.data()));
            if (isEnd && !isPieceFull)
                return converted;
        }
    }

private:
    bool isOpen() const { return reinterpret_cast<std::intptr_t>(m_handle) != -1; }

    iconv_t m_handle;
};

std::optional<QByteArray> toUtf8From(const QByteArray &charset, std::string_view bytes)
{
    return Converter{charset.constData(), utf8Charset}.convert(bytes);
}

std::optional<QByteArray> fromUtf8To(const QByteArray &charset, std::string_view utf8)
{
    return Converter{utf8Charset, charset.constData()}.convert(utf8);
}

// The charset of the environment's locale. The process may have another one: Qt 6 sets it to UTF-8, whatever the
// environment says.
QByteArray localeCharset()
{
    const locale_t locale{newlocale(LC_CTYPE_MASK, "", nullptr)};
    if (!locale)
        return utf8Charset;
    QByteArray charset{nl_langinfo_l(CODESET, locale)};
    freelocale(locale);
    return charset;
}

// A few charsets give bytes of ASCII another meaning (Shift_JIS has a currency sign for the backslash); statements are
// made of them.
bool holdsAscii(const QByteArray &charset)
{
    std::array<char, 0x80> ascii{};
    std::iota(ascii.begin(), ascii.end(), '\0');
    const std::string_view text{ascii.data(), ascii.size()};
    const std::optional<QByteArray> utf8{toUtf8From(charset, text)};
    return utf8 && viewOf(*utf8) == text;
}

bool survivesIn(const QByteArray &charset, const QByteArray &bytes)
{
    const std::optional<QByteArray> utf8{toUtf8From(charset, viewOf(bytes))};
    return utf8 && fromUtf8To(charset, viewOf(*utf8)) == bytes;
}

bool continuesCharacter(char byte) { return (static_cast<Byte>(byte) & 0xC0U) == 0x80; }

// Where a text of UTF-8 can be parted, near its middle if possible; its end when it is one character.
std::size_t middleOf(std::string_view utf8)
{
    std::size_t middle{utf8.size() / 2};
    while (middle > 0 && continuesCharacter(utf8[middle]))
        --middle;
    if (middle > 0)
        return middle;
    const auto second = std::find_if_not(utf8.begin() + 1, utf8.end(), continuesCharacter);
    return static_cast<std::size_t>(second - utf8.begin());
}

// Halves what the charset cannot hold until the characters that it lacks stand alone.
QByteArray encodedWithGaps(const QByteArray &charset, std::string_view utf8)
{
    const std::optional<QByteArray> bytes{fromUtf8To(charset, utf8)};
    if (bytes) {
        const std::optional<QByteArray> back{toUtf8From(charset, viewOf(*bytes))};
        if (back && viewOf(*back) == utf8)
            return *bytes;
    }
    const std::size_t middle{middleOf(utf8)};
    if (middle == utf8.size())
        return {utf8.data(), static_cast<int>(utf8.size())};
    return encodedWithGaps(charset, utf8.substr(0, middle)) + encodedWithGaps(charset, utf8.substr(middle));
}

// One byte of a text takes two in a QString, and up to three as UTF-8.
static_assert(qint64{3} * TextEncoding::longestText < std::numeric_limits<int>::max());

} // namespace

TextEncoding::TextEncoding(const QByteArray &charset)
    : m_charset{charset}
{
}

TextEncoding TextEncoding::detect(const QByteArray &bytes) { return detect(bytes, localeCharset()); }

TextEncoding TextEncoding::detect(const QByteArray &bytes, const QByteArray &charset)
{
    if (charset != utf8Charset && holdsAscii(charset) && (isAscii(bytes) || survivesIn(charset, bytes)))
        return TextEncoding{charset};
    return isUtf8(bytes) ? TextEncoding{} : TextEncoding{latin1Charset};
}

QString TextEncoding::decode(const QByteArray &bytes) const
{
    const QByteArray utf8{toUtf8(bytes)};
    const QString text{QString::fromUtf8(utf8.constData(), utf8.size())};
    // QString takes a byte order mark away, which is text like any other.
    return utf8.startsWith("\xEF\xBB\xBF") ? QChar{QChar::ByteOrderMark} + text : text;
}

QByteArray TextEncoding::encode(const QString &text) const { return fromUtf8(text.toUtf8()); }

QByteArray TextEncoding::toUtf8(const QByteArray &bytes) const
{
    if (m_charset.isEmpty() || isAscii(bytes))
        return bytes;
    return toUtf8From(m_charset, viewOf(bytes)).value_or(bytes);
}

QByteArray TextEncoding::fromUtf8(const QByteArray &utf8) const
{
    return m_charset.isEmpty() || isAscii(utf8) ? utf8 : encodedWithGaps(m_charset, viewOf(utf8));
}
