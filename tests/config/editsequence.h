// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "tests/config/editedmodel.h"

/// Where the choices of an edit come from.
class Choices
{
public:
    Choices() = default;
    virtual ~Choices() = default;
    Q_DISABLE_COPY_MOVE(Choices)

    /// A number from 0 on, less than `limit`.
    virtual int below(int limit) = 0;
};

/// A configuration that is edited in any way, of which some things hold after each edit.
class EditSequence final
{
public:
    explicit EditSequence(const QString &configuration);
    Q_DISABLE_COPY_MOVE(EditSequence)

    /// How many kinds of edits there are.
    static int kinds();

    DhcpdConfigModel &model() { return m_edited.model(); }
    const DhcpdConfigModel &model() const { return m_edited.model(); }

    /// Makes one edit of a statement. Fails the test unless it changed something or was refused, and was announced as
    /// such, and unless the tree is whole and stays the same when it is written and read.
    void edit(Choices &choices);

    /// The kind of the last edit, and how many changes and refusals it announced.
    int kind() const { return m_kind; }
    int changes() const { return m_changes; }
    int errors() const { return m_errors; }

private:
    EditedModel m_edited;
    int m_kind{};
    int m_changes{};
    int m_resets{};
    int m_errors{};
};
