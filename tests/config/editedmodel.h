// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigmodel.h"

#include <QSignalSpy>

#include <functional>

/// An edit of a configuration and its result.
struct EditCase
{
    using Edit = std::function<void(DhcpdConfigModel &model, const QModelIndex &index)>;

    QString before; ///< a configuration
    QString target; ///< the statement whose index `edit` gets, see EditedModel::find()
    Edit edit;
    QString after; ///< the outline afterwards, see EditedModel::outline()
    int resets{1};
};
Q_DECLARE_METATYPE(EditCase)
Q_DECLARE_METATYPE(EditCase::Edit)

/// An edit that is refused with a message.
struct Refusal
{
    QString before;
    QString target;
    EditCase::Edit edit;
    QString error;
};
Q_DECLARE_METATYPE(Refusal)

/// A model of a configuration that records the signals it emits.
class EditedModel final
{
public:
    explicit EditedModel(const QString &configuration);
    Q_DISABLE_COPY_MOVE(EditedModel)

    DhcpdConfigModel &model() { return m_model; }
    const DhcpdConfigModel &model() const { return m_model; }

    /// The first statement whose words, joined by spaces, begin with `text`; the "All network" node for an empty text,
    /// an invalid index for "top".
    QModelIndex find(const QString &text) const;

    /// One line for each statement but the "All network" node: its words with bars between them, indented by its depth,
    /// and a brace behind a declaration.
    QString outline() const;

    /// Fails the test unless the model reported one change of everything, with that many resets, and no error.
    void verifyChange(int resets) const;
    /// Fails the test unless the model reported that error and nothing else.
    void verifyRefusal(const QString &error) const;

private:
    DhcpdConfigModel m_model;
    QSignalSpy m_errors{&m_model, &DhcpdConfigModel::error};
    QSignalSpy m_changes{&m_model, &QAbstractItemModel::dataChanged};
    QSignalSpy m_resets{&m_model, &QAbstractItemModel::modelReset};
    QSignalSpy m_resetStarts{&m_model, &QAbstractItemModel::modelAboutToBeReset};
};

/// Runs an edit and compares everything about it.
void verifyEdit(const EditCase &edit);
void verifyRefusal(const Refusal &refusal);

/// Fails the test unless the parent and the row that every statement knows are those of its place in the tree.
void verifyLinks(const DhcpdConfigModel &model);

/// Edits as the rows of a table name them.
EditCase::Edit addSubnet(const char *address, const char *mask);
EditCase::Edit addRange(const char *start, const char *end);
EditCase::Edit addHost(const char *name, const char *mac, const char *address);
/// An operation that adds a parameter of one value.
using ValueOperation = void (DhcpdConfigModel::*)(const QString &value, const QModelIndex &parent);
EditCase::Edit addValue(ValueOperation add, const char *value);
