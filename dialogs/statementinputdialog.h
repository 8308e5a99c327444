// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class StatementInputDialog;
}

/// Asks for a statement as free text: a keyword followed by its arguments. Return breaks the line; Ctrl+Return saves.
class StatementInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit StatementInputDialog(QWidget *parent = nullptr);
    ~StatementInputDialog() override;
    Q_DISABLE_COPY_MOVE(StatementInputDialog)

    void setLabelText(const QString &text);
    void setStatementText(const QString &text);
    /// The text split at every single space, so that two spaces give an empty word; two words at least.
    QStringList statementWords() const;

public slots:
    /// Does nothing while the text is empty.
    void accept() override;

private:
    const std::unique_ptr<Ui::StatementInputDialog> m_ui;
};
