// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/subnetinputdialog.h"

#include "dialogs/fields.h"
#include "dialogs/netmask.h"
#include "dialogs/patterns.h"
#include "ui_subnetinputdialog.h"

#include <QHostAddress>

namespace {

constexpr QLatin1Char prefixMark{'/'};

} // namespace

SubnetInputDialog::SubnetInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::SubnetInputDialog>()}
{
    m_ui->setupUi(this);
    fields::validate(m_ui->address, patterns::subnet());
    fields::widenFor(m_ui->address, QStringLiteral("255.255.255.255/32"));
    fields::validate(m_ui->netmask, patterns::netmask());
    connect(m_ui->address, &QLineEdit::textEdited, this, &SubnetInputDialog::handleAddressEdited);
    connect(m_ui->address, &QLineEdit::textChanged, this, &SubnetInputDialog::handleAddressEdited);
}

SubnetInputDialog::~SubnetInputDialog() = default;

void SubnetInputDialog::setAddress(const QString &text) { m_ui->address->setText(text); }

void SubnetInputDialog::setNetmask(const QString &text) { m_ui->netmask->setText(text); }

QString SubnetInputDialog::address() const { return m_ui->address->text().split(prefixMark).value(0); }

QString SubnetInputDialog::netmask() const { return m_ui->netmask->text(); }

void SubnetInputDialog::handleAddressEdited(const QString &text)
{
    const bool hasPrefix{text.contains(prefixMark)};
    m_ui->netmask->setEnabled(!hasPrefix);
    if (!hasPrefix)
        return;
    const auto [address, prefixLength] = QHostAddress::parseSubnet(text);
    const QString netmask{netmaskText(address, prefixLength)};
    if (!netmask.isEmpty())
        setNetmask(netmask);
}
