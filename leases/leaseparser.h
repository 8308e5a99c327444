// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetable.h"

#include <QString>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// Reads the text of a lease file, given piece by piece, into a table of leases.
///
/// It relies on the layout in which the DHCP server writes lines, not on the grammar: the first keyword or brace in a
/// line decides what the line is, and its words, split at single spaces, are the values. Only what stands outside
/// double quotes and comments counts as a keyword or a brace, since what is quoted was sent by clients. Values are kept
/// from block to block: what a block does not state is as in the block before it.
class LeaseParser final
{
public:
    explicit LeaseParser(LeaseTable &table);
    Q_DISABLE_COPY_MOVE(LeaseParser)

    /// Forgets all that was fed, and empties the table.
    void clear();

    /// Takes the next piece of the text; its leases are pending in the table.
    void feed(std::string_view bytes);

    /// Reads what follows the last line feed as a line, since there is no more text for now. Does nothing when called
    /// again before more is fed.
    void finish();

    /// Whether more text can be fed after finish(): not if a line that was not complete yet has ended a block.
    bool canContinue() const { return !m_blockEnded; }

private:
    /// What a block holds when it ends.
    struct Values
    {
        Lease lease;
        std::optional<QString> addressText;
    };

    void feedLines(std::string_view bytes);
    void readLine(std::string_view line);
    const char *readUsualLine(const char *line, const char *end);
    const char *afterSetting(const char *begin, const char *end);
    bool isHarmless(std::string_view beginning);

    void startBlock(std::string_view address);
    void endBlock();
    void setMac(std::string_view mac) { m_values.lease.mac = m_table.texts(LeaseColumn::Mac).add(mac); }
    void setHost(std::string_view host) { m_values.lease.host = m_table.texts(LeaseColumn::HostName).add(host); }
    void setState(std::string_view state);
    void setUsualState(std::size_t state);

    LeaseTable &m_table;
    Values m_values;
    std::string m_unfinished; // the part of the last line that was fed
    std::optional<Values> m_beforeUnfinished;
    bool m_blockEnded{false};                  // since finish() began to read the unfinished line
    std::vector<LeaseTexts::Id> m_usualStates; // by their places in the list of usual states
    std::vector<std::string> m_harmless;       // the beginnings of settings, which recur
};
