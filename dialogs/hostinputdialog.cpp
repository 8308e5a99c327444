// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/hostinputdialog.h"

#include "dialogs/fields.h"
#include "dialogs/patterns.h"
#include "ui_hostinputdialog.h"

HostInputDialog::HostInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::HostInputDialog>()}
{
    m_ui->setupUi(this);
    fields::validate(m_ui->hostName, patterns::hostName());
    fields::widenForName(m_ui->hostName);
    fields::maskAsMac(m_ui->hostMac);
    fields::validate(m_ui->hostIp, patterns::looseAddress());
}

HostInputDialog::~HostInputDialog() = default;

void HostInputDialog::setName(const QString &text) { m_ui->hostName->setText(text); }

QString HostInputDialog::name() const { return m_ui->hostName->text(); }

void HostInputDialog::setMac(const QString &text) { m_ui->hostMac->setText(text); }

QString HostInputDialog::mac() const { return m_ui->hostMac->text(); }

void HostInputDialog::setIp(const QString &text) { m_ui->hostIp->setText(text); }

QString HostInputDialog::ip() const { return m_ui->hostIp->text(); }

void HostInputDialog::accept()
{
    if (!name().isEmpty())
        QDialog::accept();
}
