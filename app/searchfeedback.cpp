// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/searchfeedback.h"

#include "app/windowtext.h"

#include <QAbstractItemModel>
#include <QEvent>
#include <QLineEdit>

#include <utility>

namespace {

constexpr auto foundStyle = "QLineEdit { color: black; }";
constexpr auto notFoundStyle = "QLineEdit { color: red; }";
constexpr auto styleOnDark = "QLineEdit { color: %1; }";
constexpr auto redOnDark = "#ff8a8a";

constexpr int darkest{128};               // the least lightness of a light palette
constexpr float placeholderOpacity{0.8F}; // Qt's half is too faint to be read easily

} // namespace

SearchFeedback::SearchFeedback(QLineEdit *field, const QAbstractItemModel *found)
    : QObject{field}
    , m_field{field}
    , m_found{found}
{
    connect(found, &QAbstractItemModel::modelReset, this, &SearchFeedback::describe);
    connect(found, &QAbstractItemModel::rowsInserted, this, &SearchFeedback::describe);
    connect(found, &QAbstractItemModel::rowsRemoved, this, &SearchFeedback::describe);
    // The field's own palette has the colour of its style.
    field->parentWidget()->installEventFilter(this);
    colour();
}

void SearchFeedback::show(bool hasMatches)
{
    // Setting a style has all of the page painted anew.
    const Colour shown{hasMatches ? Colour::Found : Colour::NotFound};
    if (std::exchange(m_colour, shown) != shown)
        colour();
    describe();
}

bool SearchFeedback::eventFilter(QObject * /*watched*/, QEvent *event)
{
    if (event->type() == QEvent::PaletteChange)
        colour();
    return false;
}

void SearchFeedback::colour()
{
    const QPalette surroundings{m_field->parentWidget()->palette()};
    const QColor &text{surroundings.color(QPalette::Text)};
    const bool isDark{surroundings.color(QPalette::Base).lightness() < darkest};
    const bool isFound{m_colour == Colour::Found};
    const QString onLight{QLatin1String{isFound ? foundStyle : notFoundStyle}};
    const QString onDark{QString{QLatin1String{styleOnDark}}.arg(isFound ? text.name() : QLatin1String{redOnDark})};
    if (m_colour != Colour::Untouched)
        m_field->setStyleSheet(isDark ? onDark : onLight);

    // After the style, which has an idea of its own.
    QColor faint{text};
    faint.setAlphaF(placeholderOpacity);
    QPalette palette;
    palette.setColor(QPalette::PlaceholderText, faint);
    m_field->setPalette(palette);
}

void SearchFeedback::describe()
{
    QString description;
    if (const int leases{m_found->rowCount()}; !m_field->text().isEmpty())
        description = leases > 0 ? WindowText::tr("Leases found: %1").arg(leases) : WindowText::tr("No leases found");
    if (description != m_field->accessibleDescription())
        m_field->setAccessibleDescription(description);
}
