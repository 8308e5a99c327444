// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>

class QAbstractItemModel;
class QLineEdit;

/// What the search field tells of its search: to those who see it by the colour of its text, on light palettes and dark
/// ones, and to those who do not by its description, with the number of leases found.
class SearchFeedback final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(SearchFeedback)

public:
    /// Serves `field`, a child of another widget, for as long as it lives; `found` holds the leases found.
    SearchFeedback(QLineEdit *field, const QAbstractItemModel *found);

    /// Tells of a new search, whether it has matches. The colour stays until the next one, the number follows the
    /// leases.
    void show(bool hasMatches);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    enum class Colour
    {
        Untouched,
        Found,
        NotFound
    };

    void colour();
    void describe();

    QLineEdit *m_field;
    const QAbstractItemModel *m_found;
    Colour m_colour{Colour::Untouched};
};
