// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <array>
#include <memory>

class QSpinBox;

namespace Ui {
class TimeInputDialog;
}

/// Asks for a duration, as months of 30 days, days, hours, minutes and seconds. The limits of 24 hours, 60 minutes and
/// 60 seconds are deliberate, and so is the spelling of "Mounth".
class TimeInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit TimeInputDialog(QWidget *parent = nullptr);
    ~TimeInputDialog() override;
    Q_DISABLE_COPY_MOVE(TimeInputDialog)

    /// Shows `value` seconds. A part that does not fit its field becomes the nearest that does.
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
