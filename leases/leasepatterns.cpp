// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasepatterns.h"

#include <QStringList>

#include <algorithm>
#include <numeric>

namespace {

constexpr int octets{4};
constexpr std::size_t secondsOfDay{86'400};
// No text of a time has more separators.
constexpr int mostSplits{13};

bool isAscii(char byte) { return static_cast<quint8>(byte) < 0x80; }

const char *endOf(std::string_view text) { return text.data() + text.size(); }

bool isAscii(std::string_view text)
{
    return isAscii(std::accumulate(text.begin(), text.end(), '\0',
                                   [](char all, char byte) { return static_cast<char>(all | byte); }));
}

/// Whether the text of an octet can stand where part `part` of a needle that was split at its dots is.
bool octetFits(const QString &octet, const QStringList &parts, int part, Qt::CaseSensitivity sensitivity)
{
    if (part < 0 || part >= parts.size()) {
        return true;
    }
    const bool reachesBack{part > 0};
    const bool reachesOn{part + 1 < parts.size()};
    const QString &text{parts[part]};
    if (!reachesBack && !reachesOn) {
        return octet.contains(text, sensitivity);
    }
    return (!reachesBack || octet.startsWith(text, sensitivity)) && (!reachesOn || octet.endsWith(text, sensitivity)) &&
           (!(reachesBack && reachesOn) || octet.size() == text.size());
}

} // namespace

LeaseAddressPattern::LeaseAddressPattern(const LeaseNeedle &needle)
{
    const QStringList parts{needle.text.split(QLatin1Char{'.'})};
    unsigned startsForAll{~0U};
    for (int octet{0}; octet < octets; ++octet) {
        auto &fits{m_fits.at(static_cast<std::size_t>(octet))};
        unsigned startsForSome{0};
        for (std::size_t value{0}; value < fits.size(); ++value) {
            const QString text{QString::number(value)};
            unsigned starts{0};
            for (int start{0}; start + parts.size() <= octets; ++start) {
                if (octetFits(text, parts, octet - start, needle.sensitivity)) {
                    starts |= 1U << static_cast<unsigned>(start);
                }
            }
            fits.at(value) = static_cast<quint8>(starts);
            startsForSome |= starts;
        }
        startsForAll &= startsForSome;
    }
    m_canBeIn = startsForAll != 0;
}

LeaseTimePattern::LeaseTimePattern(LeaseNeedle needle, LeaseTimeTexts &texts)
    : m_needle{std::move(needle)}
    , m_texts{texts}
    , m_timesOfDay(secondsOfDay)
{
    const QString &text{m_needle.text};
    if (text.count(LeaseTimeTexts::separator) <= mostSplits) {
        for (int at{text.indexOf(LeaseTimeTexts::separator)}; at >= 0;
             at = text.indexOf(LeaseTimeTexts::separator, at + 1)) {
            m_splits.push_back({text.left(at), text.mid(at + 1)});
        }
    }
}

template<typename FitsSplit>
LeaseTimePattern::Fits LeaseTimePattern::findFits(unsigned in, unsigned inOther, const QString &text,
                                                  const FitsSplit &fitsSplit) const
{
    unsigned fits{known | inOther};
    if (m_needle.isIn(text)) {
        fits |= in;
    }
    unsigned bit{firstSplit};
    for (const Split &split : m_splits) {
        if (fitsSplit(text, split)) {
            fits |= bit;
        }
        bit <<= 1U;
    }
    return static_cast<Fits>(fits);
}

LeaseTimePattern::Fits LeaseTimePattern::timeOfDayFits(LeaseTime time) const
{
    Fits &fits{m_timesOfDay[time.secondOfDay()]};
    if (fits == 0) {
        fits =
            findFits(inTimeOfDay, inDate, m_texts.timeOfDayText(time), [this](const QString &text, const Split &split) {
                return text.endsWith(split.before, m_needle.sensitivity);
            });
    }
    return fits;
}

LeaseTimePattern::Fits LeaseTimePattern::dateFits(LeaseTime time) const
{
    const std::size_t year{time.dateKey() >> 16U};
    if (year >= m_years.size()) {
        m_years.resize(year + 1);
    }
    if (!m_years[year]) {
        m_years[year] = std::make_unique<Year>();
    }
    const std::size_t month{time.dateKey() >> 8U & 0xFFU};
    const std::size_t day{time.dateKey() & 0xFFU};
    Fits &fits{m_years[year]->at(month * daysOfMonth + day)};
    if (fits == 0) {
        fits = findFits(inDate, inTimeOfDay, m_texts.dateText(time), [this](const QString &text, const Split &split) {
            return text.startsWith(split.after, m_needle.sensitivity);
        });
    }
    return fits;
}

LeaseTextPattern::LeaseTextPattern(LeaseNeedle needle)
    : m_needle{std::move(needle)}
{
    const bool ignoresCase{m_needle.sensitivity == Qt::CaseInsensitive};
    for (const QChar character : qAsConst(m_needle.text)) {
        const QChar folded{ignoresCase ? character.toCaseFolded() : character};
        m_canBeInAscii = m_canBeInAscii && folded.unicode() < 0x80;
        const bool isLetter{folded >= QLatin1Char{'a'} && folded <= QLatin1Char{'z'}};
        const auto caseBit{static_cast<quint8>(ignoresCase && isLetter ? 'a' ^ 'A' : 0)};
        m_bytes.push_back({caseBit, static_cast<quint8>(folded.unicode())});
    }
    constexpr ByteTest any{0xFF, 0xFF};
    constexpr ByteTest none{0xFF, 0};
    m_first = !m_canBeInAscii ? none : m_bytes.empty() ? any : m_bytes[0];
    m_second = m_bytes.size() < 2 ? any : m_bytes[1];
}

bool LeaseTextPattern::isIn(std::string_view bytes) const
{
    if (!isAscii(bytes)) {
        return m_needle.isIn(decodeLeaseText(bytes));
    }
    return m_canBeInAscii &&
           (m_bytes.empty() || std::search(bytes.begin(), bytes.end(), m_bytes.begin(), m_bytes.end(),
                                           [](char byte, ByteTest test) { return test.accepts(byte); }) != bytes.end());
}

const char *LeaseTextPattern::nextCandidate(std::string_view memory) const
{
    // Without a branch for each byte, so that the processor takes many at once.
    constexpr int block{64};
    const auto hasCandidate{[first = m_first, second = m_second](const char *at) {
        unsigned found{0};
        for (int i{0}; i < block; ++i) {
            const bool isCandidate{
                (static_cast<unsigned>(first.accepts(at[i])) & static_cast<unsigned>(second.accepts(at[i + 1]))) != 0};
            found |= static_cast<unsigned>(isCandidate) | static_cast<unsigned>(!isAscii(at[i]));
        }
        return found != 0;
    }};
    const char *at{memory.data()};
    const char *const end{endOf(memory)};
    while (end - at > block && !hasCandidate(at)) {
        at += block;
    }
    return std::find_if(at, end, [this, end](const char &byte) {
        return !isAscii(byte) || (m_first.accepts(byte) && (&byte + 1 == end || m_second.accepts(*(&byte + 1))));
    });
}

LeaseTextScan::LeaseTextScan(const LeaseTextPattern &pattern, const LeaseTexts &texts)
    : m_pattern{pattern}
    , m_texts{texts}
    , m_begin{texts.memory().data()}
    , m_candidate{pattern.nextCandidate(texts.memory())}
    , m_hasCandidates{m_candidate != endOf(texts.memory())}
{
}

bool LeaseTextScan::operator()(LeaseTexts::Id id)
{
    const std::string_view text{m_texts.at(id)};
    const char *const begin{text.data()};
    if (begin < m_begin) {
        return m_pattern.isIn(text);
    }
    if (begin > m_candidate) {
        m_begin = begin;
        m_candidate =
            m_pattern.nextCandidate(m_texts.memory().substr(static_cast<std::size_t>(begin - m_texts.memory().data())));
    }
    return m_candidate < begin + text.size() && m_pattern.isIn(text);
}
