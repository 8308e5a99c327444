// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/domaininputdialog.h"

#include "config/values.h"
#include "dialogs/fields.h"
#include "dialogs/patterns.h"
#include "ui_domaininputdialog.h"

DomainInputDialog::DomainInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::DomainInputDialog>()}
{
    m_ui->setupUi(this);
    fields::validate(m_ui->domainName, patterns::domain());
    fields::widenForName(m_ui->domainName);
}

DomainInputDialog::~DomainInputDialog() = default;

void DomainInputDialog::setLabel(const QString &text) { m_ui->domainLabel->setText(text); }

void DomainInputDialog::setDomain(const QString &text) { m_ui->domainName->setText(values::unquoted(text)); }

QString DomainInputDialog::domain() const { return values::quoted(m_ui->domainName->text()); }

void DomainInputDialog::accept()
{
    if (!m_ui->domainName->text().isEmpty())
        QDialog::accept();
}
