// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QPushButton;
class QWidget;

/// What the buttons inside dialogs need for those who use the keyboard.
namespace buttons {

/// Lets Return press `button` while that has the keyboard, as Space does. Anywhere else Return stays with the dialog's
/// default button.
void pressByReturn(QPushButton *button);
/// Disables `button`. If that has the keyboard, `next` gets it, rather than whatever comes behind the button.
void disable(QPushButton *button, QWidget *next);

} // namespace buttons
