// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leaseaddresspattern.h"

#include "leases/leaseneedle.h"

#include <QStringList>

namespace {

constexpr int octets{4};

/// Whether the text of an octet fits part `part` of a needle that was split at its dots.
bool octetFits(const QString &octet, const QStringList &parts, int part, Qt::CaseSensitivity sensitivity)
{
    if (part < 0 || part >= parts.size())
        return true;
    const bool reachesBack{part > 0};
    const bool reachesOn{part + 1 < parts.size()};
    const QString &text{parts[part]};
    if (!reachesBack && !reachesOn)
        return octet.contains(text, sensitivity);
    return (!reachesBack || octet.startsWith(text, sensitivity)) && (!reachesOn || octet.endsWith(text, sensitivity)) &&
           (!(reachesBack && reachesOn) || octet.size() == text.size());
}

} // namespace

LeaseAddressPattern::LeaseAddressPattern(const LeaseNeedle &needle)
{
    const QStringList parts{needle.text.split(QLatin1Char{'.'})};
    unsigned startsForAll{~0U};
    for (int octet{0}; octet < octets; ++octet) {
        std::array<quint8, 256> &fits{m_fits.at(static_cast<std::size_t>(octet))};
        unsigned startsForSome{0};
        for (std::size_t value{0}; value < fits.size(); ++value) {
            const QString text{QString::number(value)};
            unsigned starts{0};
            for (int start{0}; start + parts.size() <= octets; ++start) {
                if (octetFits(text, parts, octet - start, needle.sensitivity))
                    starts |= 1U << static_cast<unsigned>(start);
            }
            fits.at(value) = static_cast<quint8>(starts);
            startsForSome |= starts;
        }
        startsForAll &= startsForSome;
    }
    m_canBeIn = startsForAll != 0;
}
