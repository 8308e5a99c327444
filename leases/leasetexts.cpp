// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetexts.h"

#include "common/textencoding.h"

#include <algorithm>
#include <cstring>
#include <limits>

QByteArray leaseBytes(std::string_view text)
{
    return {text.data(), static_cast<int>(std::min(text.size(), std::size_t{TextEncoding::longestText}))};
}

QString decodeLeaseText(std::string_view text)
{
    const QByteArray bytes{leaseBytes(text)};
    return TextEncoding::detect(bytes).decode(bytes);
}

LeaseTexts::Id LeaseTexts::add(std::string_view text)
{
    const std::size_t id{m_bytes.size()};
    if (text.empty() || id > std::numeric_limits<Id>::max()) // beyond 4 GiB of texts, cells stay empty
        return {};
    if (text.size() < static_cast<unsigned char>(longText)) {
        m_bytes.push_back(static_cast<char>(text.size()));
    } else {
        const quint64 size{text.size()};
        m_bytes.push_back(longText);
        m_bytes.append(reinterpret_cast<const char *>(&size), sizeof size);
    }
    m_bytes.append(text);
    return static_cast<Id>(id);
}

std::string_view LeaseTexts::longTextAt(Id id) const
{
    const char *text{m_bytes.data() + id + 1};
    quint64 size{};
    std::memcpy(&size, text, sizeof size);
    return {text + sizeof size, size};
}
