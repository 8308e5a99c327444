// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/rangeinputdialog.h"

#include "dialogs/fields.h"
#include "dialogs/patterns.h"
#include "ui_rangeinputdialog.h"

#include <QLineEdit>

RangeInputDialog::RangeInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::RangeInputDialog>()}
{
    m_ui->setupUi(this);
    fields::validate(m_ui->startIP, patterns::strictAddress());
    m_ui->endIP->setValidator(m_ui->startIP->validator());
    for (QLineEdit *field : {m_ui->startIP, m_ui->endIP})
        fields::widenForAddress(field);
}

RangeInputDialog::~RangeInputDialog() = default;

void RangeInputDialog::setStartIp(const QString &text) { m_ui->startIP->setText(text); }

QString RangeInputDialog::startIp() const { return m_ui->startIP->text(); }

void RangeInputDialog::setEndIp(const QString &text) { m_ui->endIP->setText(text); }

QString RangeInputDialog::endIp() const { return m_ui->endIP->text(); }
