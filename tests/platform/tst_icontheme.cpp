// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/icontheme.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

namespace {

/// A theme to install: where, what its index says, and which icons ("folder/file") it has.
struct Theme
{
    QString path; ///< below the folder that holds the search paths
    QString index;
    QStringList icons{};
};

const QStringList names{QStringLiteral("one"), QStringLiteral("two"), QStringLiteral("three"), QStringLiteral("four")};

QString listing(const QString &folders, const QString &more = {})
{
    return QStringLiteral("[Icon Theme]\nName=Test\n%2\nDirectories=%1\n\n[22/actions]\nSize=22\nDirectories=none\n")
        .arg(folders, more);
}

QString inheriting(const QString &parents)
{
    return listing(QStringLiteral("22/actions"), QStringLiteral("Inherits=") + parents);
}

// The first `count` of the names.
QStringList icons(int count, const QString &form = QStringLiteral("22/actions/%1.svg"))
{
    QStringList files;
    for (const QString &name : names.mid(0, count))
        files.append(form.arg(name));
    return files;
}

void install(const QDir &root, const QString &file, const QString &content = {})
{
    QVERIFY(root.mkpath(QFileInfo{file}.path()));
    QFile written{root.filePath(file)};
    QVERIFY(written.open(QIODevice::WriteOnly));
    written.write(content.toUtf8());
}

} // namespace

Q_DECLARE_METATYPE(std::vector<Theme>)

class IconThemeTest final : public QObject
{
    Q_OBJECT

private slots:
    void theFirstGoodOneIsChosen_data();
    void theFirstGoodOneIsChosen();
};

void IconThemeTest::theFirstGoodOneIsChosen_data()
{
    QTest::addColumn<std::vector<Theme>>("themes");
    QTest::addColumn<QString>("onLight");
    QTest::addColumn<QString>("onDark");

    const QString plain{listing(QStringLiteral("22/actions"))};
    const QString a{QStringLiteral("a")};
    const QString b{QStringLiteral("b")};
    const QString none;
    const auto row = [](const char *name, const std::vector<Theme> &themes, const QString &onLight,
                        const QString &onDark) { QTest::addRow("%s", name) << themes << onLight << onDark; };

    row("nothing installed", {}, none, none);
    row("by name", {{b, plain, icons(3)}, {a, plain, icons(3)}}, a, a);
    row("the first has too few", {{a, plain, icons(1)}, {b, plain, icons(3)}}, b, b);
    row("preferred ones first",
        {{a, plain, icons(3)}, {QStringLiteral("gnome"), plain, icons(3)}, {QStringLiteral("breeze"), plain, icons(3)}},
        QStringLiteral("breeze"), QStringLiteral("breeze"));
    row("preferred though another has more", {{a, plain, icons(4)}, {QStringLiteral("breeze"), plain, icons(2)}},
        QStringLiteral("breeze"), QStringLiteral("breeze"));
    row("the preferred has too few", {{a, plain, icons(2)}, {QStringLiteral("breeze"), plain, icons(1)}}, a, a);
    row("half of the names", {{a, plain, icons(2)}}, a, a);
    row("less than half of the names", {{a, plain, icons(1)}}, none, none);
    row("the dark sibling has more", {{a, plain, icons(3)}, {QStringLiteral("a-Dark"), plain, icons(4)}}, a,
        QStringLiteral("a-Dark"));
    row("the dark sibling alone", {{QStringLiteral("a-dark"), plain, icons(3)}}, QStringLiteral("a-dark"),
        QStringLiteral("a-dark"));
    row("the light one has too few", {{a, plain, icons(1)}, {QStringLiteral("a-dark"), plain, icons(3)}},
        QStringLiteral("a-dark"), QStringLiteral("a-dark"));
    row("high contrast has more", {{a, plain, icons(2)}, {QStringLiteral("HighContrast"), plain, icons(4)}}, a,
        QStringLiteral("HighContrast"));
    row("names of the parents count",
        {{a, inheriting(QStringLiteral("b, c")), icons(1)},
         {b, plain, {QStringLiteral("22/actions/three.svg")}},
         {QStringLiteral("c"), plain, {QStringLiteral("22/actions/four.svg")}}},
        a, a);
    row("parents in a ring", {{a, inheriting(b), icons(1)}, {b, inheriting(a), {QStringLiteral("22/actions/two.svg")}}},
        a, a);
    row("names of what every theme falls back on count for none",
        {{a, inheriting(QStringLiteral("hicolor")), icons(1)}, {QStringLiteral("hicolor"), plain, icons(4)}}, none,
        none);
    row("a parent that is missing", {{a, inheriting(b), icons(2)}}, a, a);
    row("several folders",
        {{a, listing(QStringLiteral("16,22/actions , x/y")), icons(1) << QStringLiteral("x/y/two.png")},
         {b, plain, icons(3)}},
        a, a);
    row("a folder that the index does not list", {{a, plain, icons(4, QStringLiteral("48/apps/%1.svg"))}}, none, none);
    row("files of another kind", {{a, plain, icons(4, QStringLiteral("22/actions/%1.txt"))}}, none, none);
    row("hidden", {{a, listing(QStringLiteral("22/actions"), QStringLiteral("Hidden=true")), icons(4)}}, none, none);
    row("only cursors", {{a, QStringLiteral("[Icon Theme]\nInherits=b\n"), {}}, {b, plain, icons(3)}}, b, b);
    row("no index", {{a, {}, icons(4)}}, none, none);
    row("an index of nonsense", {{a, QStringLiteral("\x01[[[=,=\n]=Directories"), icons(4)}}, none, none);
    row("in the second search path", {{QStringLiteral("../second/a"), plain, icons(3)}}, a, a);
    row("in both search paths",
        {{a, plain, icons(1)}, {QStringLiteral("../second/a"), plain, icons(4)}, {b, plain, icons(3)}}, b, b);
}

void IconThemeTest::theFirstGoodOneIsChosen()
{
    QFETCH(const std::vector<Theme>, themes);
    QFETCH(const QString, onLight);
    QFETCH(const QString, onDark);
    QTemporaryDir folder;
    const QDir first{folder.filePath(QStringLiteral("first"))};
    QVERIFY(first.mkpath(QStringLiteral(".")));
    for (const Theme &theme : themes) {
        if (!theme.index.isEmpty())
            install(first, theme.path + QStringLiteral("/index.theme"), theme.index);
        for (const QString &icon : theme.icons)
            install(first, theme.path + QLatin1Char{'/'} + icon);
    }
    const QStringList searchPaths{folder.filePath(QStringLiteral("missing")), first.path(),
                                  folder.filePath(QStringLiteral("second"))};
    QCOMPARE(suitableIconTheme(searchPaths, names, false), onLight);
    QCOMPARE(suitableIconTheme(searchPaths, names, true), onDark);
}

QTEST_GUILESS_MAIN(IconThemeTest)
#include "tst_icontheme.moc"
