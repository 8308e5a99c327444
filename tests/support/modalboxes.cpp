// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/modalboxes.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QEvent>
#include <QFileDialog>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QTest>

#include <algorithm>

namespace {

void failTest(const QString &failure) { QTest::qFail(qPrintable(failure), __FILE__, __LINE__); }

/// Whether the window, about to be shown, makes the code that opened it wait. Submenus and a menu bar's menus after the
/// first belong to a menu that is open already.
bool isModal(const QWidget *window)
{
    if (qobject_cast<const QMenu *>(window))
        return !QApplication::activePopupWidget();
    return qobject_cast<const QDialog *>(window) && window->isModal();
}

QString described(const QWidget &window)
{
    QString text{QString::fromLatin1(window.metaObject()->className())};
    if (!window.windowTitle().isEmpty())
        text += QStringLiteral(" \"%1\"").arg(window.windowTitle());
    if (const auto *box = qobject_cast<const QMessageBox *>(&window))
        text += QStringLiteral(" saying \"%1\"").arg(box->text());
    return text;
}

void dismiss(QWidget *window)
{
    if (auto *dialog = qobject_cast<QDialog *>(window))
        dialog->done(QDialog::Rejected);
    else
        window->close();
}

/// Whether the window, if it is still there, becomes the active one. QTest::qWaitForWindowActive() is no help: it takes
/// a dialog for active while only its parent is.
bool waitForActive(const QPointer<QWidget> &window)
{
    return QTest::qWaitFor([&] { return !window || !window->isVisible() || QApplication::activeWindow() == window; });
}

QMessageBox::StandardButton defaultButton(const QMessageBox &box)
{
    const QList<QAbstractButton *> buttons{box.buttons()};
    const auto found = std::find_if(buttons.cbegin(), buttons.cend(), [](const QAbstractButton *button) {
        const auto *pushButton = qobject_cast<const QPushButton *>(button);
        return pushButton && pushButton->isDefault();
    });
    return found == buttons.cend() ? QMessageBox::NoButton : box.standardButton(*found);
}

/// A value as the message of a failure shows it.
QString shown(const QString &text) { return QLatin1Char{'"'} + text + QLatin1Char{'"'}; }
QString shown(QMessageBox::Icon icon) { return QVariant::fromValue(icon).toString(); }
QString shown(QMessageBox::StandardButtons buttons)
{
    return QString::fromLatin1(QMetaEnum::fromType<QMessageBox::StandardButtons>().valueToKeys(int{buttons}));
}

} // namespace

ModalBoxes::ModalBoxes(Report report)
    : m_report{report ? std::move(report) : failTest}
{
    QCoreApplication::setAttribute(Qt::AA_DontUseNativeDialogs);
    qApp->installEventFilter(this);
}

ModalBoxes::~ModalBoxes() { verify(); }

void ModalBoxes::expectBox(const Box &box, QMessageBox::StandardButton answer)
{
    expectBox(box, [this, answer](QMessageBox *shownBox) {
        QAbstractButton *button{shownBox->button(answer)};
        if (button)
            QTest::mouseClick(button, Qt::LeftButton);
        else
            m_report(QStringLiteral("%1 has no such button to press: %2").arg(described(*shownBox), shown(answer)));
    });
}

void ModalBoxes::expectBox(const Box &box, Qt::Key answer)
{
    expectBox(box, [answer](QMessageBox *shownBox) {
        QTest::keyClick(shownBox->focusWidget() ? shownBox->focusWidget() : shownBox, answer);
    });
}

void ModalBoxes::expectBox(const Box &box, std::function<void(QMessageBox *box)> answer)
{
    expect(QMessageBox::staticMetaObject, QStringLiteral("QMessageBox \"%1\" saying \"%2\"").arg(box.title, box.text),
           [this, box, answer = std::move(answer)](QWidget *window) {
               auto *shownBox = static_cast<QMessageBox *>(window);
               compare(box, *shownBox);
               answer(shownBox);
           });
}

void ModalBoxes::expectFileDialog(const QString &path)
{
    expectDialog<QFileDialog>([path](QFileDialog *dialog) {
        auto *name = dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"));
        QVERIFY(name);
        name->setCompleter(nullptr); // its list would stay open behind the dialog
        name->clear();
        QTest::keyClicks(name, path);
        auto *buttons = dialog->findChild<QDialogButtonBox *>(QStringLiteral("buttonBox"));
        QVERIFY(buttons);
        for (QAbstractButton *button : buttons->buttons()) {
            if (buttons->buttonRole(button) == QDialogButtonBox::AcceptRole)
                QTest::mouseClick(button, Qt::LeftButton);
        }
    });
}

void ModalBoxes::expectMenu(const QString &actionText)
{
    expectMenu([this, actionText](QMenu *menu) {
        const QList<QAction *> actions{menu->actions()};
        const auto found = std::find_if(actions.cbegin(), actions.cend(),
                                        [&](const QAction *action) { return action->text() == actionText; });
        if (found == actions.cend())
            m_report(QStringLiteral("the menu has no action \"%1\"").arg(actionText));
        else
            QTest::mouseClick(menu, Qt::LeftButton, {}, menu->actionGeometry(*found).center());
    });
}

void ModalBoxes::expectMenu(const std::function<void(QMenu *menu)> &use)
{
    expect(QMenu::staticMetaObject, QStringLiteral("QMenu"),
           [use](QWidget *window) { use(static_cast<QMenu *>(window)); });
}

void ModalBoxes::expect(const QMetaObject &type, const QString &description, std::function<void(QWidget *window)> use)
{
    m_expected.push_back({&type, description, std::move(use)});
}

void ModalBoxes::verify()
{
    if (!QTest::qWaitFor([this] { return m_expected.empty() && m_open == 0; })) {
        for (const Expected &expected : m_expected)
            m_report(QStringLiteral("never opened: ") + expected.description);
    }
    m_expected.clear();
}

bool ModalBoxes::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::Show && !event->spontaneous() && watched->isWidgetType()) {
        auto *window = static_cast<QWidget *>(watched);
        if (window->isWindow() && isModal(window)) {
            // Not before the window runs its event loop: showing it would undo an earlier closing.
            ++m_open;
            QMetaObject::invokeMethod(
                this,
                [this, window = QPointer<QWidget>{window}, opener = QPointer<QWidget>{QApplication::activeWindow()}] {
                    handleShown(window);
                    activateAgain(opener);
                    --m_open;
                },
                Qt::QueuedConnection);
        }
    }
    return QObject::eventFilter(watched, event);
}

void ModalBoxes::handleShown(const QPointer<QWidget> &window)
{
    if (window && window->windowType() != Qt::Popup && !waitForActive(window))
        m_report(QStringLiteral("never active: ") + described(*window));
    if (window && window->isVisible())
        answerNext(window);
    if (window && window->isVisible())
        dismiss(window);
}

void ModalBoxes::activateAgain(const QPointer<QWidget> &opener)
{
    if (!opener || !opener->isVisible())
        return;
    opener->activateWindow();
    if (!waitForActive(opener))
        m_report(QStringLiteral("not active again: ") + described(*opener));
}

void ModalBoxes::answerNext(const QPointer<QWidget> &window)
{
    if (m_expected.empty()) {
        m_report(QStringLiteral("unexpected: ") + described(*window));
        return;
    }
    const Expected expected{std::move(m_expected.front())};
    m_expected.pop_front();
    if (!window->metaObject()->inherits(expected.type)) {
        m_report(QStringLiteral("unexpected: %1, expected %2").arg(described(*window), expected.description));
        return;
    }
    expected.use(window);
    if (window && window->isVisible())
        m_report(QStringLiteral("left open: ") + described(*window));
}

void ModalBoxes::compare(const Box &expected, const QMessageBox &box) const
{
    const auto check = [&](const char *what, const QString &actual, const QString &wanted) {
        if (actual != wanted) {
            m_report(QStringLiteral("%1: the %2 is %3, expected %4")
                         .arg(described(box), QLatin1String{what}, actual, wanted));
        }
    };
    check("icon", shown(box.icon()), shown(expected.icon));
    check("title", shown(box.windowTitle()), shown(expected.title));
    check("text", shown(box.text()), shown(expected.text));
    check("set of buttons", shown(box.standardButtons()), shown(expected.buttons));
    check("default button", shown(defaultButton(box)), shown(expected.defaultButton));
    check("informative text", shown(box.informativeText()), shown(expected.informativeText));
    check("detailed text", shown(box.detailedText()), shown(expected.detailedText));
}

ModalBoxes::Box errorBox(const QString &text, const QString &reason)
{
    return {QMessageBox::Critical, QStringLiteral("Error"), text, QMessageBox::Ok, QMessageBox::Ok, reason};
}
