// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QMessageBox>
#include <QObject>
#include <QPointer>

#include <deque>
#include <functional>

class QDialog;
class QFileDialog;
class QMenu;

/// Answers modal dialogs, message boxes and context menus, so that a test can run a command that waits for its user:
///
///     ModalBoxes boxes;
///     boxes.expectBox({QMessageBox::Warning, "Warning!", "Do you want to resume?", QMessageBox::Yes | QMessageBox::No,
///                      QMessageBox::Yes}, QMessageBox::Yes);
///     boxes.expectDialog<HostInputDialog>([](HostInputDialog *dialog) {
///         QTest::keyClicks(dialog->focusWidget(), "host.example.org");
///         QTest::keyClick(dialog->focusWidget(), Qt::Key_Return);
///     });
///     action->trigger();
///     boxes.verify();
///
/// What is expected comes in the order in which it was announced; a box that opens from within a dialog comes after
/// that dialog. Each is answered by the event loop that it runs itself, when it is shown, active and has its focus;
/// afterwards the window that was active before is active again.
/// The function of a dialog must close it, with real events; QVERIFY and QCOMPARE can be used in it.
///
/// The test fails at once, and nothing hangs, when a modal window or context menu opens that nobody expected, when it
/// is another one than the next expected one, when a box differs from its description, or when a dialog's function
/// leaves it open: the window is then rejected. verify() fails the test when something expected has not come.
class ModalBoxes final : public QObject
{
    Q_OBJECT

public:
    /// What a message box shows.
    struct Box final
    {
        QMessageBox::Icon icon{QMessageBox::NoIcon};
        QString title{};
        QString text{};
        QMessageBox::StandardButtons buttons{QMessageBox::Ok};
        QMessageBox::StandardButton defaultButton{QMessageBox::Ok};
        QString informativeText{};
        QString detailedText{};
    };
    /// Called with the message of a failure; by default it fails the running test function.
    using Report = std::function<void(const QString &failure)>;

    explicit ModalBoxes(Report report = {});
    /// Calls verify().
    ~ModalBoxes() override;
    Q_DISABLE_COPY_MOVE(ModalBoxes)

    /// The next is a message box like `box`; `answer` is pressed with the mouse.
    void expectBox(const Box &box, QMessageBox::StandardButton answer);
    /// The next is a message box like `box`, answered by the key (Return presses its default button, Escape leaves it).
    void expectBox(const Box &box, Qt::Key answer);
    /// The next is a dialog of the class, passed to `use`.
    template<typename Dialog>
    void expectDialog(const std::function<void(Dialog *dialog)> &use)
    {
        expect(Dialog::staticMetaObject, QString::fromLatin1(Dialog::staticMetaObject.className()),
               [use](QWidget *window) { use(static_cast<Dialog *>(window)); });
    }
    /// The next is a file dialog, in which the path is typed and accepted with the mouse.
    void expectFileDialog(const QString &path);
    /// The next is a context menu; the action with the text is triggered with the mouse.
    void expectMenu(const QString &actionText);
    /// The next is a context menu, handed to `use`.
    void expectMenu(const std::function<void(QMenu *menu)> &use);

    /// Waits for the boxes that are still to come, and fails the test when they do not. To be called at the end.
    void verify();

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    struct Expected final
    {
        const QMetaObject *type;
        QString description;
        std::function<void(QWidget *window)> use;
    };

    void expect(const QMetaObject &type, const QString &description, std::function<void(QWidget *window)> use);
    void expectBox(const Box &box, std::function<void(QMessageBox *box)> answer);
    void handleShown(const QPointer<QWidget> &window);
    /// Gives the focus back to the window that had it, as a window manager does and the offscreen platform does not.
    void activateAgain(const QPointer<QWidget> &opener);
    void answerNext(const QPointer<QWidget> &window);
    void compare(const Box &expected, const QMessageBox &box) const;

    const Report m_report;
    std::deque<Expected> m_expected;
    int m_open{0};
};

/// The box in which the program tells of an error, with the reason below its text.
ModalBoxes::Box errorBox(const QString &text, const QString &reason = {});
