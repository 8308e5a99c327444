// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QAbstractButton;
class QWidget;

/// What buttons need for those who use the keyboard.
namespace buttons {

/// Lets Return press `button` while that has the keyboard, as Space does. Anywhere else Return stays with the default
/// button of a dialog.
void pressByReturn(QAbstractButton *button);
/// Disables `button`. If that has the keyboard, `next` gets it, rather than whatever comes behind the button.
void disable(QAbstractButton *button, QWidget *next);

} // namespace buttons
