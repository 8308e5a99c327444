// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class SubnetInputDialog;
}

/// Asks for the address and the netmask of a subnet. An address with a prefix length ("10.0.0.0/8") fills in the
/// netmask, which then cannot be edited.
class SubnetInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit SubnetInputDialog(QWidget *parent = nullptr);
    ~SubnetInputDialog() override;
    Q_DISABLE_COPY_MOVE(SubnetInputDialog)

    void setAddress(const QString &text);
    void setNetmask(const QString &text);
    /// The address without its prefix length.
    QString address() const;
    QString netmask() const;

private:
    void handleAddressEdited(const QString &text);

    const std::unique_ptr<Ui::SubnetInputDialog> m_ui;
};
