// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class HostInputDialog;
}

/// Asks for a host: its name, MAC address and fixed address. Only the name must not be empty.
class HostInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit HostInputDialog(QWidget *parent = nullptr);
    ~HostInputDialog() override;
    Q_DISABLE_COPY_MOVE(HostInputDialog)

    void setName(const QString &text);
    QString name() const;
    void setMac(const QString &text);
    QString mac() const;
    void setIp(const QString &text);
    QString ip() const;

public slots:
    /// Does nothing while the name is empty.
    void accept() override;

private:
    const std::unique_ptr<Ui::HostInputDialog> m_ui;
};
