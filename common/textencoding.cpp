// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/textencoding.h"

#include <QTextCodec>

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <limits>
#include <numeric>

#include <langinfo.h>

namespace {

constexpr int utf8Mib{106};
constexpr int asciiMib{3};
constexpr int latin1Mib{4};

// Texts are converted in pieces of this many bytes, so that no UTF-16 copy of a large file stands in memory.
constexpr int pieceLength{64 * 1024};

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

// The locale's codec, null for UTF-8 and for ASCII, of which UTF-8 is the larger. Null, too, for the few that give the
// bytes of ASCII another meaning (ICU's Shift_JIS turns control characters around): statements are made of them.
QTextCodec *localeCodec()
{
    QTextCodec *codec{QTextCodec::codecForLocale()};
    // Debian's ICU takes every locale for a UTF-8 one; the C library knows.
    if (codec && codec->mibEnum() == utf8Mib)
        codec = QTextCodec::codecForName(nl_langinfo(CODESET));
    if (!codec || codec->mibEnum() == utf8Mib || codec->mibEnum() == asciiMib)
        return nullptr;
    QByteArray ascii{0x80, '\0'};
    std::iota(ascii.begin(), ascii.end(), '\0');
    return codec->toUnicode(ascii) == QLatin1String{ascii.constData(), ascii.size()} ? codec : nullptr;
}

// A byte order mark is text like any other: it is neither taken away nor added.
constexpr QTextCodec::ConversionFlags keepMark{QTextCodec::IgnoreHeader};

QByteArray encoded(QTextCodec *codec, const QString &text)
{
    QTextCodec::ConverterState state{keepMark};
    return codec->fromUnicode(text.constData(), text.size(), &state);
}

// Calls `use` with the texts of the pieces of `bytes`.
template<typename Use>
void decodePieces(QTextCodec *codec, const QByteArray &bytes, Use use)
{
    QTextDecoder decoder{codec, keepMark};
    for (int at{}; at < bytes.size(); at += pieceLength)
        use(decoder.toUnicode(bytes.constData() + at, std::min(pieceLength, bytes.size() - at)));
}

bool survivesIn(QTextCodec *codec, const QByteArray &bytes)
{
    int length{};
    bool same{true};
    decodePieces(codec, bytes, [&](const QString &text) {
        const QByteArray back{same ? encoded(codec, text) : QByteArray{}};
        same = same && back.size() <= bytes.size() - length &&
               std::equal(back.cbegin(), back.cend(), bytes.cbegin() + length);
        length += back.size();
    });
    return same && length == bytes.size();
}

bool isPairAt(const QString &text, int at)
{
    return at + 1 < text.size() && text.at(at).isHighSurrogate() && text.at(at + 1).isLowSurrogate();
}

// Halves what the codec cannot hold until the characters that it lacks stand alone.
QByteArray encodedWithGaps(QTextCodec *codec, const QString &text)
{
    QByteArray bytes{encoded(codec, text)};
    if (QTextDecoder{codec, keepMark}.toUnicode(bytes) == text)
        return bytes;
    if (text.size() == 1 || (text.size() == 2 && isPairAt(text, 0)))
        return text.toUtf8();
    const int half{text.size() / 2 + (isPairAt(text, text.size() / 2 - 1) ? 1 : 0)};
    return encodedWithGaps(codec, text.left(half)) + encodedWithGaps(codec, text.mid(half));
}

// One byte of a text takes two in a QString, and up to three as UTF-8.
static_assert(qint64{3} * TextEncoding::longestText < std::numeric_limits<int>::max());

QTextCodec *utf8Codec() { return QTextCodec::codecForMib(utf8Mib); }

} // namespace

TextEncoding::TextEncoding(QTextCodec *codec)
    : m_codec{codec}
{
}

TextEncoding TextEncoding::detect(const QByteArray &bytes)
{
    QTextCodec *locale{localeCodec()};
    if (locale && (isAscii(bytes) || survivesIn(locale, bytes)))
        return TextEncoding{locale};
    return isUtf8(bytes) ? TextEncoding{} : TextEncoding{QTextCodec::codecForMib(latin1Mib)};
}

QString TextEncoding::decode(const QByteArray &bytes) const
{
    return QTextDecoder{m_codec ? m_codec : utf8Codec(), keepMark}.toUnicode(bytes);
}

QByteArray TextEncoding::encode(const QString &text) const { return m_codec ? fromUtf8(text.toUtf8()) : text.toUtf8(); }

QByteArray TextEncoding::toUtf8(const QByteArray &bytes) const
{
    if (!m_codec || isAscii(bytes))
        return bytes;
    QByteArray utf8;
    utf8.reserve(bytes.size());
    decodePieces(m_codec, bytes, [&](const QString &text) { utf8 += text.toUtf8(); });
    return utf8;
}

QByteArray TextEncoding::fromUtf8(const QByteArray &utf8) const
{
    if (!m_codec || isAscii(utf8))
        return utf8;
    QByteArray bytes;
    bytes.reserve(utf8.size());
    decodePieces(utf8Codec(), utf8, [&](const QString &text) { bytes += encodedWithGaps(m_codec, text); });
    return bytes;
}
