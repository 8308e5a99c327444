// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/sharednetworkinputdialog.h"

#include "dialogs/fields.h"
#include "ui_sharednetworkinputdialog.h"

SharedNetworkInputDialog::SharedNetworkInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::SharedNetworkInputDialog>()}
{
    m_ui->setupUi(this);
    fields::widenForName(m_ui->name);
}

SharedNetworkInputDialog::~SharedNetworkInputDialog() = default;

void SharedNetworkInputDialog::setName(const QString &text) { m_ui->name->setText(text); }

QString SharedNetworkInputDialog::name() const { return m_ui->name->text(); }
