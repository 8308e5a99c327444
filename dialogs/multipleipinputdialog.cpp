// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/multipleipinputdialog.h"

#include "config/values.h"
#include "dialogs/buttons.h"
#include "dialogs/ipinputdialog.h"
#include "dialogs/spokenfocus.h"
#include "ui_multipleipinputdialog.h"

MultipleIpInputDialog::MultipleIpInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::MultipleIpInputDialog>()}
{
    m_ui->setupUi(this);
    connect(m_ui->addButton, &QPushButton::clicked, this, &MultipleIpInputDialog::handleAddIp);
    connect(m_ui->removeButton, &QPushButton::clicked, this, &MultipleIpInputDialog::handleRemoveIps);
    new SpokenFocus{m_ui->ipList};
    for (QPushButton *button : {m_ui->addButton, m_ui->removeButton})
        buttons::pressByReturn(button);
    connect(m_ui->ipList, &QListWidget::currentItemChanged, this, [this] { m_ui->removeButton->setEnabled(true); });
}

MultipleIpInputDialog::~MultipleIpInputDialog() = default;

void MultipleIpInputDialog::setLabel(const QString &text)
{
    m_ui->ipGroup->setTitle(text);
    m_ui->ipList->setAccessibleName(text);
}

void MultipleIpInputDialog::setIps(const QString &text)
{
    const QStringList parts{QString{text}.remove(QLatin1Char{' '}).split(QLatin1Char{','})};
    for (const QString &part : parts)
        appendIp(part);
}

QString MultipleIpInputDialog::ips() const
{
    QStringList texts;
    for (int row{0}; row < m_ui->ipList->count(); ++row)
        texts.append(m_ui->ipList->item(row)->text());
    return texts.join(QLatin1String{", "});
}

void MultipleIpInputDialog::accept()
{
    if (m_ui->ipList->count() > 0)
        QDialog::accept();
}

void MultipleIpInputDialog::appendIp(const QString &text)
{
    if (const auto address = values::usableAddress(text))
        m_ui->ipList->addItem(*address);
}

void MultipleIpInputDialog::handleAddIp()
{
    IpInputDialog dialog{this};
    dialog.setWindowTitle(tr("Add IP"));
    if (dialog.exec() == Accepted)
        appendIp(dialog.ip());
}

void MultipleIpInputDialog::handleRemoveIps()
{
    qDeleteAll(m_ui->ipList->selectedItems());
    if (m_ui->ipList->count() == 0)
        buttons::disable(m_ui->removeButton, m_ui->ipList);
}
