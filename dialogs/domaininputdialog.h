// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class DomainInputDialog;
}

/// Asks for a domain name, shown bare. The configuration keeps it in double quotes, so the setter takes quotes off and
/// the getter puts them on.
class DomainInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit DomainInputDialog(QWidget *parent = nullptr);
    ~DomainInputDialog() override;
    Q_DISABLE_COPY_MOVE(DomainInputDialog)

    /// What the field is called, where it is another name than that of a domain.
    void setLabel(const QString &text);
    void setDomain(const QString &text);
    QString domain() const;

public slots:
    /// Does nothing while the field is empty.
    void accept() override;

private:
    const std::unique_ptr<Ui::DomainInputDialog> m_ui;
};
