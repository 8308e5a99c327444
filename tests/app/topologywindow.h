// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "app/fmain.h"
#include "tests/app/testmachine.h"
#include "tests/support/modalboxes.h"
#include "tests/support/text.h"

#include <QByteArray>
#include <QModelIndex>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>

class DhcpdConfigModel;
class QAction;
class QDialog;
class QMenu;
class QTreeView;

/// The texts between " | ".
inline QStringList list(const char *bars) { return text(bars).split(text(" | ")); }

/// The entries that lead to a command of a submenu of the context menus.
inline QStringList parameter(const char *entry) { return {text("Add parameter"), text(entry)}; }
inline QStringList option(const char *entry) { return {text("Add parameter"), text("Add option"), text(entry)}; }

/// The main window on a configuration, its topology tree driven the way a user does it. The bind9 package is installed.
///
/// A statement is named by the beginning of its words, joined by spaces; the "All network" node by an empty text.
class TopologyWindow final
{
public:
    explicit TopologyWindow(const QByteArray &configuration);
    ~TopologyWindow();
    Q_DISABLE_COPY_MOVE(TopologyWindow)

    FMain &window() const { return *m_window; }
    QTreeView &tree() const;
    DhcpdConfigModel &model() const;
    QAction &action(const char *name) const;

    /// The index of a statement; fails the test when there is none.
    QModelIndex find(const QString &statement, int column = 0) const;
    /// The words of the current statement; none for an invalid index and for the "All network" node.
    QString current() const;
    /// The words of every statement that is shown with its children, "All network" among them as an empty text.
    QStringList openBranches() const;
    bool isInView(const QModelIndex &index) const;

    /// Scrolls to the statement and clicks it.
    void select(const QString &statement, int column = 0) const;
    void doubleClick(const QString &statement, int column = 0) const;
    /// Clicks the statement with the right button and then the entries of the menu, submenus first. What the command
    /// opens is to be announced in `expectAnswers`.
    void choose(ModalBoxes &boxes, const QString &statement, const QStringList &entries,
                const std::function<void()> &expectAnswers = {}) const;
    /// Clicks the statement with the right button and passes the menu that opens to `use`.
    void openMenu(ModalBoxes &boxes, const QString &statement, const std::function<void(QMenu *menu)> &use,
                  const std::function<void()> &expectAnswers = {}) const;

    /// The configuration as a save would write it.
    QByteArray content() const;
    /// What has changed since the window opened: every line that was removed ("-") or added ("+"), behind the headings
    /// of the blocks around it.
    QStringList changes() const;
    /// What has changed in the tree since the window opened: every row that was removed ("-") or added ("+"), as
    /// "label: value".
    QStringList shownChanges() const;
    bool offersSave() const;
    /// Saves the configuration with the keyboard, and returns what the file holds then.
    QByteArray saveToFile(ModalBoxes &boxes) const;
    /// How often the model has reported a change since the window opened.
    int notices() const { return m_notices; }
    int resets() const { return m_resets; }

private:
    TestMachine m_machine;
    std::unique_ptr<FMain> m_window;
    QByteArray m_opened;
    QStringList m_shownAtFirst;
    int m_notices{};
    int m_resets{};
};

/// Does something with a dialog's fields.
using Fill = std::function<void(ModalBoxes &boxes, QDialog *dialog)>;
Q_DECLARE_METATYPE(Fill)

/// What an input dialog should show, and what to do in it.
struct Input final
{
    QString title;
    QStringList shown; ///< the texts of its labels and fields, see shownIn()
    Fill fill{};
};
Q_DECLARE_METATYPE(Input)

/// The texts of a dialog's captions and fields in the order of the form. The entries of a list and the cells of a table
/// are one text; a check box has its state, and a star when it cannot be changed.
QStringList shownIn(const QWidget &dialog);

/// Types into one field after the other; a null text leaves its field as it is.
Fill type(const QStringList &texts);
/// Adds addresses to a list of them.
Fill addAddresses(const QStringList &addresses);
/// Adds a route, given by its net mask, network and gateway, and chooses the kind.
Fill addRoute(const QStringList &cells, bool ms);
/// Types over a cell of the table of routes.
Fill typeInCell(int row, int column, const QString &text);

/// Presses the button that accepts a dialog.
void save(const QDialog &dialog);

/// The question before every editor of free text.
ModalBoxes::Box advancedBox();

/// The next dialog is like `input`, is filled and saved; with an `error`, a box that says it comes next.
void expectSaved(ModalBoxes &boxes, const Input &input, const QString &error = {});
/// The next dialog is like `input`, is filled and cancelled.
void expectCancelled(ModalBoxes &boxes, const Input &input);
