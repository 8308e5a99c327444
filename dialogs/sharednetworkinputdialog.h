// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class SharedNetworkInputDialog;
}

/// Asks for the name of a shared network: any text.
class SharedNetworkInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit SharedNetworkInputDialog(QWidget *parent = nullptr);
    ~SharedNetworkInputDialog() override;
    Q_DISABLE_COPY_MOVE(SharedNetworkInputDialog)

    void setName(const QString &text);
    QString name() const;

private:
    const std::unique_ptr<Ui::SharedNetworkInputDialog> m_ui;
};
