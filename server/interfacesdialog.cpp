// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/interfacesdialog.h"

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QLabel>
#include <QScreen>
#include <QScrollArea>
#include <QScrollBar>
#include <QVBoxLayout>

#include <memory>

InterfacesDialog::InterfacesDialog(const QMap<QString, bool> &interfaces, QWidget *parent)
    : QDialog{parent}
    , m_groupBox{new QGroupBox{QDialog::tr("Available interfaces")}}
    , m_buttonBox{new QDialogButtonBox{QDialogButtonBox::Save | QDialogButtonBox::Cancel}}
{
    setWindowTitle(QDialog::tr("Select interfaces"));
    fillGroupBox(interfaces);
    auto *layout = new QVBoxLayout{this};
    layout->addWidget(m_groupBox);
    m_buttonBox->setCenterButtons(true);
    layout->addWidget(m_buttonBox);
    scrollWhenTooTall();

    connect(m_buttonBox, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(m_buttonBox, &QDialogButtonBox::rejected, this, &QDialog::reject);
}

InterfacesDialog::~InterfacesDialog() = default;

QMap<QString, bool> InterfacesDialog::interfaces() const
{
    QMap<QString, bool> interfaces;
    for (const QCheckBox *checkBox : m_checkBoxes)
        interfaces.insert(checkBox->text(), checkBox->isChecked());
    return interfaces;
}

void InterfacesDialog::fillGroupBox(const QMap<QString, bool> &interfaces)
{
    auto *layout = new QVBoxLayout{m_groupBox};
    layout->setAlignment(Qt::AlignTop);
    if (interfaces.isEmpty())
        layout->addWidget(new QLabel{QDialog::tr("Available interfaces are not found!")});
    for (auto entry = interfaces.cbegin(); entry != interfaces.cend(); ++entry) {
        auto *checkBox = new QCheckBox{entry.key()};
        checkBox->setChecked(entry.value());
        layout->addWidget(checkBox);
        m_checkBoxes.append(checkBox);
    }
}

// A layout makes its window as tall as its widgets need. Beyond two thirds of the screen, the limit that Qt itself sets
// for a new window, the list scrolls instead, so that the buttons stay within reach.
void InterfacesDialog::scrollWhenTooTall()
{
    if (sizeHint().height() * 3 <= screen()->availableGeometry().height() * 2)
        return;
    auto *scrollArea = new QScrollArea;
    scrollArea->setFrameShape(QFrame::NoFrame);
    scrollArea->setFocusPolicy(Qt::NoFocus); // the keyboard moves from box to box, and the area follows
    scrollArea->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    scrollArea->setWidgetResizable(true);
    // By itself the area asks for the width of the check boxes only, not for that of the group's title.
    scrollArea->setMinimumWidth(m_groupBox->minimumSizeHint().width() +
                                scrollArea->verticalScrollBar()->sizeHint().width());
    const std::unique_ptr<QLayoutItem> replaced{layout()->replaceWidget(m_groupBox, scrollArea)};
    scrollArea->setWidget(m_groupBox);
}
