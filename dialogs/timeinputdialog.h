// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <array>
#include <memory>

class QSpinBox;

namespace Ui {
class TimeInputDialog;
}

/// Asks for a duration, as months of 30 days, days, hours, minutes and seconds. That hours go to 24, minutes and
/// seconds to 60, and the spelling of "Mounth" are deliberate.
class TimeInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit TimeInputDialog(QWidget *parent = nullptr);
    ~TimeInputDialog() override;
    Q_DISABLE_COPY_MOVE(TimeInputDialog)

    /// Shows `value` seconds. A part that its field cannot hold is cut to the nearest that it can.
    void setSeconds(int value);
    /// The duration in seconds, as decimal text.
    QString seconds() const;

private:
    struct Unit final
    {
        QSpinBox *field;
        int seconds;
    };
    std::array<Unit, 5> units() const;

    const std::unique_ptr<Ui::TimeInputDialog> m_ui;
};
