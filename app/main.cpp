// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"
#include "platform/displaycheck.h"
#include "platform/orvinit.h"
#include "platform/qtsingleapplication.h"
#include "platform/runtimedirectory.h"

#include <QIcon>
#include <QLibraryInfo>
#include <QMessageBox>
#include <QTranslator>

#include <cstdlib>
#include <optional>
#include <unistd.h>

namespace {

constexpr const char *description{QT_TRANSLATE_NOOP("OrvHelpMenu", "Configure DHCP server")};
constexpr int raiseMilliseconds{5000};

void installTranslator(QTranslator *translator, const QString &name, const QString &directory)
{
    if (translator->load(QLocale{}, name, QStringLiteral("_"), directory))
        QCoreApplication::installTranslator(translator);
}

} // namespace

int main(int argc, char *argv[])
{
    orvSetAttributes();
    // By which a Wayland compositor finds the entry in the menu, and so the icon.
    QGuiApplication::setDesktopFileName(QStringLiteral("org.orv.admin.dhcp"));
    provideRuntimeDirectory();
    std::optional<DisplayCheck> displayCheck{std::in_place};
    QtSingleApplication application{argc, argv};
    displayCheck.reset();

    QTranslator qtTranslator;
    QTranslator translator;
    installTranslator(&qtTranslator, QStringLiteral("qtbase"), QLibraryInfo::location(QLibraryInfo::TranslationsPath));
    installTranslator(&translator, QStringLiteral("orv-admin-dhcp"), QStringLiteral(":/i18n"));

    if (application.isRunning()) {
        application.sendMessage(QStringLiteral("raise"), raiseMilliseconds);
        return EXIT_FAILURE;
    }

    orvInit(ORV_VERSION, description);
    if (getuid() != 0) {
        QMessageBox::critical(nullptr, QObject::tr("Error"), QObject::tr("Must be superuser"), QMessageBox::Ok);
        return EXIT_FAILURE;
    }
    QtSingleApplication::setWindowIcon(QIcon::fromTheme(QStringLiteral("orv-admin-dhcp")));

    FMain window;
    application.setActivationWindow(&window, true);
    window.show();
    return QtSingleApplication::exec();
}
