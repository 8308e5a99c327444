// SPDX-License-Identifier: GPL-3.0-or-later
// What the start of the program is compared with: the least that a program with a main window does, with the same
// attributes.
#include "platform/orvinit.h"

#include <QApplication>
#include <QMainWindow>

int main(int argc, char *argv[])
{
    orvSetAttributes();
    const QApplication application{argc, argv};
    QMainWindow window;
    window.show();
    return QApplication::exec();
}
