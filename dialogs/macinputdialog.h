// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class MacInputDialog;
}

/// Asks for a MAC address, which may stay unfinished.
class MacInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit MacInputDialog(QWidget *parent = nullptr);
    ~MacInputDialog() override;
    Q_DISABLE_COPY_MOVE(MacInputDialog)

    void setMac(const QString &text);
    QString mac() const;

private:
    const std::unique_ptr<Ui::MacInputDialog> m_ui;
};
