// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/ipinputdialog.h"

#include "dialogs/fields.h"
#include "dialogs/patterns.h"
#include "ui_ipinputdialog.h"

IpInputDialog::IpInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::IpInputDialog>()}
{
    m_ui->setupUi(this);
    fields::validate(m_ui->ip, patterns::looseAddress());
    fields::widenForAddress(m_ui->ip);
}

IpInputDialog::~IpInputDialog() = default;

void IpInputDialog::setIp(const QString &text) { m_ui->ip->setText(text); }

QString IpInputDialog::ip() const { return m_ui->ip->text(); }
