// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvinit.h"

#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QIcon>
#include <QImage>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

#include <array>

namespace {

constexpr std::array iconNames{
    "view-refresh",
    "document-save",
    "application-exit",
    "view-restore",
    "configure",
    "media-playback-start",
    "media-playback-stop",
    "preferences-system-network",
    "network",
    "computer",
    "list-add",
    "list-remove",
    "edit-clear",
    "edit-find",
    "previous",
    "next",
    "orv-admin-dhcp",
};

const QString bundledIcons{QStringLiteral(":/icons")};

// Whether the icon shows anything at all.
bool isVisible(const QIcon &icon, int size)
{
    const QImage image{icon.pixmap(size).toImage().convertToFormat(QImage::Format_ARGB32)};
    for (int y{0}; y < image.height(); ++y) {
        for (int x{0}; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) > 128)
                return true;
        }
    }
    return false;
}

void writeFile(const QString &path, const QByteArray &content)
{
    QVERIFY(QDir{}.mkpath(QFileInfo{path}.path()));
    QFile file{path};
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(content);
}

} // namespace

class OrvInitTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();

    void versionAndDescriptionAreKept();
    void noNameIsSet();
    void noIconIsBlank_data();
    void noIconIsBlank();
    void installedThemeIsTaken();
    void bundledIconsFillTheGapsOfATheme();
    void systemsIndexOfTheFallbackThemeDoesNotHideTheBundledIcons();
    void themeOfTheDesktopIsKept();

private:
    QString m_applicationName{QCoreApplication::applicationName()};
};

void OrvInitTest::init()
{
    QIcon::setThemeSearchPaths({bundledIcons});
    QIcon::setThemeName({});
}

void OrvInitTest::versionAndDescriptionAreKept()
{
    orvInit("2.1.6+ci1", "Configure DHCP server");
    QCOMPARE(QCoreApplication::applicationVersion(), QStringLiteral("2.1.6+ci1"));
    QCOMPARE(orvDescription(), QStringLiteral("Configure DHCP server"));
}

// Where the settings are and what the windows are called follows from them.
void OrvInitTest::noNameIsSet()
{
    orvInit("1", "text");
    QCOMPARE(QCoreApplication::applicationName(), m_applicationName);
    QCOMPARE(QGuiApplication::applicationDisplayName(), m_applicationName);
    QCOMPARE(QCoreApplication::organizationName(), QString{});
    QCOMPARE(QCoreApplication::organizationDomain(), QString{});
}

void OrvInitTest::noIconIsBlank_data()
{
    QTest::addColumn<QStringList>("searchPaths");
    QTest::addColumn<QString>("theme");
    QTest::addColumn<QString>("icon");
    const QStringList system{QStandardPaths::locateAll(QStandardPaths::GenericDataLocation, QStringLiteral("icons"),
                                                       QStandardPaths::LocateDirectory)};
    for (const char *name : iconNames) {
        const QString icon{QLatin1String{name}};
        QTest::addRow("nothing installed, %s", name) << QStringList{bundledIcons} << QString{} << icon;
        QTest::addRow("nothing installed, hicolor named, %s", name)
            << QStringList{bundledIcons} << QStringLiteral("hicolor") << icon;
        QTest::addRow("this machine's themes, %s", name) << system + QStringList{bundledIcons} << QString{} << icon;
        QTest::addRow("a theme that is missing, %s", name)
            << system + QStringList{bundledIcons} << QStringLiteral("nonexistent") << icon;
    }
}

void OrvInitTest::noIconIsBlank()
{
    QFETCH(const QStringList, searchPaths);
    QFETCH(const QString, theme);
    QFETCH(const QString, icon);
    QIcon::setThemeSearchPaths(searchPaths);
    QIcon::setThemeName(theme);
    orvInit("1", "text");
    for (const int size : {16, 22, 24, 32, 48})
        QVERIFY2(isVisible(QIcon::fromTheme(icon), size), qPrintable(QString::number(size)));
}

void OrvInitTest::installedThemeIsTaken()
{
    QTemporaryDir folder;
    const QString theme{folder.filePath(QStringLiteral("complete"))};
    writeFile(theme + QStringLiteral("/index.theme"), "[Icon Theme]\nDirectories=22\n\n[22]\nSize=22\n");
    for (const char *name : iconNames)
        writeFile(theme + QStringLiteral("/22/") + QLatin1String{name} + QStringLiteral(".svg"), {});
    QIcon::setThemeSearchPaths({folder.path(), bundledIcons});
    orvInit("1", "text");
    QCOMPARE(QIcon::themeName(), QStringLiteral("complete"));
}

void OrvInitTest::bundledIconsFillTheGapsOfATheme()
{
    QTemporaryDir folder;
    const QString theme{folder.filePath(QStringLiteral("partial"))};
    QImage red{22, 22, QImage::Format_ARGB32};
    red.fill(Qt::red);
    writeFile(theme + QStringLiteral("/index.theme"), "[Icon Theme]\nDirectories=22\n\n[22]\nSize=22\n");
    QVERIFY(QDir{theme}.mkpath(QStringLiteral("22")));
    QVERIFY(red.save(theme + QStringLiteral("/22/network.png")));
    QIcon::setThemeSearchPaths({folder.path(), bundledIcons});
    QIcon::setThemeName(QStringLiteral("partial"));
    orvInit("1", "text");
    QCOMPARE(QIcon::fromTheme(QStringLiteral("network")).pixmap(22).toImage().pixelColor(11, 11), QColor{Qt::red});
    QVERIFY(isVisible(QIcon::fromTheme(QStringLiteral("computer")), 22));
}

// Qt reads one index for each theme, the first that it finds.
void OrvInitTest::systemsIndexOfTheFallbackThemeDoesNotHideTheBundledIcons()
{
    QTemporaryDir folder;
    writeFile(folder.filePath(QStringLiteral("hicolor/index.theme")),
              "[Icon Theme]\nHidden=true\nDirectories=48x48/apps\n\n[48x48/apps]\nSize=48\nType=Threshold\n");
    QIcon::setThemeSearchPaths({folder.path(), bundledIcons});
    orvInit("1", "text");
    for (const char *name : iconNames)
        QVERIFY2(isVisible(QIcon::fromTheme(QLatin1String{name}), 22), name);
}

void OrvInitTest::themeOfTheDesktopIsKept()
{
    QIcon::setThemeName(QStringLiteral("desktops"));
    orvInit("1", "text");
    QCOMPARE(QIcon::themeName(), QStringLiteral("desktops"));
}

QTEST_MAIN(OrvInitTest)
#include "tst_orvinit.moc"
