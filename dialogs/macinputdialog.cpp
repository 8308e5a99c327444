// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/macinputdialog.h"

#include "dialogs/fields.h"
#include "ui_macinputdialog.h"

MacInputDialog::MacInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::MacInputDialog>()}
{
    m_ui->setupUi(this);
    fields::maskAsMac(m_ui->mac);
}

MacInputDialog::~MacInputDialog() = default;

void MacInputDialog::setMac(const QString &text)
{
    m_ui->mac->setText(text);
    // Nothing can be typed behind the last digit of a full mask.
    m_ui->mac->setCursorPosition(0);
}

QString MacInputDialog::mac() const { return m_ui->mac->text(); }
