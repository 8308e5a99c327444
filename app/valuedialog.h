// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/parameterkind.h"

#include <QString>

#include <functional>
#include <memory>

class DhcpdConfigStatement;
class QDialog;
class QWidget;

/// The dialog that asks for a value of one type.
struct ValueDialog final
{
    /// `label` is what the dialog calls the value; where it is empty, or the dialog has no such caption, it is the
    /// dialog's own. There are dialogs for address lists, domain names, MAC addresses and seconds.
    static ValueDialog make(ValueType type, const QString &label, QWidget *parent);

    std::unique_ptr<QDialog> dialog;
    std::function<void(const QString &value)> setValue;
    std::function<QString()> value;
};
