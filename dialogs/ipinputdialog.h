// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class IpInputDialog;
}

/// Asks for one address.
class IpInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit IpInputDialog(QWidget *parent = nullptr);
    ~IpInputDialog() override;
    Q_DISABLE_COPY_MOVE(IpInputDialog)

    void setIp(const QString &text);
    QString ip() const;

private:
    const std::unique_ptr<Ui::IpInputDialog> m_ui;
};
