// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/commandguard.h"

#include <QApplication>

bool mayStartCommand() { return !QApplication::activeModalWidget(); }
