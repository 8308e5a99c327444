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
/// It goes by lines in the layout that the DHCP server writes, not by the grammar: the first keyword or brace in a line
/// decides what the line is, and its words, counted between single spaces, are the values. Only what stands outside
/// double quotes and comments counts as a keyword or a brace, since what is quoted was sent by clients. Values are kept
/// from block to block: what a block does not say is as in the block before it.
class LeaseParser final
{
public:
    explicit LeaseParser(LeaseTable &table);
    Q_DISABLE_COPY_MOVE(LeaseParser)

    /// Forgets all that was fed, and empties the table.
    void clear();

    /// Takes the next piece of the text; its leases are pending in the table.
    void feed(std::string_view bytes);

    /// Takes what follows the last line feed as a line, for there is no more text now; once until more is fed.
    void finish();

    /// Whether the table holds after finish() what more text can be added to. Not so if a line that was not complete
    /// yet ended a block.
    bool canContinue() const { return !m_blockEnded; }

private:
    /// The values that a block is given when it ends.
    struct Values
    {
        Lease lease;
        std::optional<QString> addressText;
    };

    void feedLines(std::string_view bytes);
    void readLine(std::string_view line);
    bool readUsualLine(std::string_view line);
    static bool readUsualTime(std::string_view line, std::string_view keyword, LeaseTime &time);
    void readAnyLine(std::string_view line);

    void startBlock(std::string_view address);
    void endBlock();
    void setState(std::string_view state);
    LeaseTexts::Id add(std::string_view text) { return m_table.texts().add(text); }

    LeaseTable &m_table;
    Values m_values;
    std::string m_unfinished; // what was fed of the last line
    std::optional<Values> m_beforeUnfinished;
    bool m_blockEnded{false};                  // since finish() began to read the unfinished line
    std::vector<LeaseTexts::Id> m_usualStates; // those that occurred, at their places in the list of usual states
};
