// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

#include <array>

struct LeaseNeedle;

/// Tells whether a needle is in the text of an IPv4 address without making that text.
class LeaseAddressPattern final
{
public:
    explicit LeaseAddressPattern(const LeaseNeedle &needle);

    /// Whether it may be in any address at all.
    bool canBeIn() const { return m_canBeIn; }

    bool isIn(quint32 address) const
    {
        return (m_fits[0][address >> 24U] & m_fits[1][address >> 16U & 0xFFU] & m_fits[2][address >> 8U & 0xFFU] &
                m_fits[3][address & 0xFFU]) != 0;
    }

private:
    // For each octet and each value of it, a bit for each of the octets in which the needle can begin: whether the
    // value fits there.
    std::array<std::array<quint8, 256>, 4> m_fits{};
    bool m_canBeIn{};
};
