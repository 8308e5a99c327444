// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/domaininputdialog.h"

#include "dialogs/fields.h"
#include "dialogs/patterns.h"
#include "ui_domaininputdialog.h"

namespace {

constexpr QLatin1Char quote{'"'};

} // namespace

DomainInputDialog::DomainInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::DomainInputDialog>()}
{
    m_ui->setupUi(this);
    fields::restrain(m_ui->domainName, patterns::domain());
    fields::widenForName(m_ui->domainName);
}

DomainInputDialog::~DomainInputDialog() = default;

void DomainInputDialog::setDomain(const QString &text) { m_ui->domainName->setText(QString{text}.remove(quote)); }

QString DomainInputDialog::domain() const { return quote + m_ui->domainName->text() + quote; }

void DomainInputDialog::accept()
{
    if (!m_ui->domainName->text().isEmpty())
        QDialog::accept();
}
