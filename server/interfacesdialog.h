// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>
#include <QList>
#include <QMap>
#include <QString>

class QCheckBox;
class QDialogButtonBox;
class QGroupBox;

/// Lets the user choose the interfaces that the DHCP server serves.
class InterfacesDialog final : public QDialog
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(InterfacesDialog)

public:
    /// Shows a check box for every name of `interfaces`, checked where its value is true.
    explicit InterfacesDialog(const QMap<QString, bool> &interfaces, QWidget *parent = nullptr);
    ~InterfacesDialog() override;

    /// The names shown, each with whether it is checked.
    QMap<QString, bool> interfaces() const;

private:
    void fillGroupBox(const QMap<QString, bool> &interfaces);
    void scrollWhenTooTall();

    QList<QCheckBox *> m_checkBoxes;
    QGroupBox *m_groupBox;
    QDialogButtonBox *m_buttonBox;
};
