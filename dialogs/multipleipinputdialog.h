// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class MultipleIpInputDialog;
}

/// Asks for a list of addresses, at least one.
class MultipleIpInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit MultipleIpInputDialog(QWidget *parent = nullptr);
    ~MultipleIpInputDialog() override;
    Q_DISABLE_COPY_MOVE(MultipleIpInputDialog)

    /// The caption of the list: what the addresses are.
    void setLabel(const QString &text);
    /// Lists the addresses of a comma-separated text, except loopback, broadcast and whatever is no address.
    void setIps(const QString &text);
    /// The listed addresses, separated by comma and space.
    QString ips() const;

public slots:
    /// Does nothing while the list is empty.
    void accept() override;

private:
    void appendIp(const QString &text);
    void handleAddIp();
    void handleRemoveIps();

    const std::unique_ptr<Ui::MultipleIpInputDialog> m_ui;
};
