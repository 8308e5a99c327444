// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/helpwindow.h"

#include <QDialogButtonBox>
#include <QScreen>
#include <QVBoxLayout>

namespace {

constexpr int usualDpi{96};

} // namespace

HelpWindow::HelpWindow(const QString &title, QWidget *content, QSize size, QWidget *parent)
    : QDialog{parent}
{
    setAttribute(Qt::WA_DeleteOnClose);
    setWindowTitle(title);
    auto *buttons = new QDialogButtonBox{QDialogButtonBox::Close};
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto *layout = new QVBoxLayout{this};
    layout->addWidget(content);
    layout->addWidget(buttons);
    content->setFocus();
    resize((size * logicalDpiX() / usualDpi).boundedTo(screen()->availableSize()));
}

void HelpWindow::bringUp()
{
    show();
    raise();
    activateWindow();
}
