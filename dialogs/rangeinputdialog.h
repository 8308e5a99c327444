// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class RangeInputDialog;
}

/// Asks for the first and the last address of a dynamic range. Their order is left to the caller to check.
class RangeInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit RangeInputDialog(QWidget *parent = nullptr);
    ~RangeInputDialog() override;
    Q_DISABLE_COPY_MOVE(RangeInputDialog)

    void setStartIp(const QString &text);
    QString startIp() const;
    void setEndIp(const QString &text);
    QString endIp() const;

private:
    const std::unique_ptr<Ui::RangeInputDialog> m_ui;
};
