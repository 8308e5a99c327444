// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/timeinputdialog.h"

#include "ui_timeinputdialog.h"

TimeInputDialog::TimeInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::TimeInputDialog>()}
{
    m_ui->setupUi(this);
}

TimeInputDialog::~TimeInputDialog() = default;

void TimeInputDialog::setSeconds(int value)
{
    int rest{value};
    for (const auto &[field, length] : units()) {
        field->setValue(rest / length);
        rest %= length;
    }
}

QString TimeInputDialog::seconds() const
{
    int total{0};
    for (const auto &[field, length] : units())
        total += field->value() * length;
    return QString::number(total);
}

std::array<TimeInputDialog::Unit, 5> TimeInputDialog::units() const
{
    return {{{m_ui->mounth, 30 * 24 * 60 * 60},
             {m_ui->days, 24 * 60 * 60},
             {m_ui->hours, 60 * 60},
             {m_ui->minutes, 60},
             {m_ui->seconds, 1}}};
}
