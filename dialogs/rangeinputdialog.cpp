// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/rangeinputdialog.h"

#include "dialogs/fields.h"
#include "dialogs/patterns.h"
#include "ui_rangeinputdialog.h"

#include <QRegularExpressionValidator>

RangeInputDialog::RangeInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::RangeInputDialog>()}
{
    m_ui->setupUi(this);
    auto *validator = new QRegularExpressionValidator{patterns::strictAddress(), this};
    for (QLineEdit *field : {m_ui->startIP, m_ui->endIP}) {
        field->setValidator(validator);
        fields::widenForAddress(field);
    }
}

RangeInputDialog::~RangeInputDialog() = default;

void RangeInputDialog::setStartIp(const QString &text) { m_ui->startIP->setText(text); }

QString RangeInputDialog::startIp() const { return m_ui->startIP->text(); }

void RangeInputDialog::setEndIp(const QString &text) { m_ui->endIP->setText(text); }

QString RangeInputDialog::endIp() const { return m_ui->endIP->text(); }
