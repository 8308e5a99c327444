// SPDX-License-Identifier: GPL-3.0-or-later
// Texts and icons have a contrast of 4.5 at least to what is behind them, measured in pictures of the window.
#include "tests/app/topologywindow.h"

#include "common/paths.h"
#include "platform/orvinit.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/temporaryroot.h"

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QHeaderView>
#include <QIcon>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QPainter>
#include <QStatusBar>
#include <QStyle>
#include <QTabBar>
#include <QTableView>
#include <QToolBar>
#include <QToolButton>
#include <QTreeView>

#include <algorithm>
#include <array>
#include <cmath>

namespace {

constexpr double leastContrast{4.5};

const QByteArray configuration{R"(default-lease-time 600;
shared-network campus {
    subnet 10.0.1.0 netmask 255.255.255.0 {
        option routers 10.0.1.1;
    }
}
host printer {
    hardware ethernet 00:00:5e:00:53:01;
}
)"};

const QByteArray leases{R"(lease 10.0.1.7 {
  starts 1 2026/03/02 08:00:00;
  ends 1 2026/03/02 20:00:00;
  binding state active;
  hardware ethernet 00:00:5e:00:53:02;
  client-hostname "pc";
}
lease 10.0.1.8 {
  starts 1 2026/03/02 08:00:00;
  ends 1 2026/03/02 20:00:00;
  binding state active;
  hardware ethernet 00:00:5e:00:53:03;
  client-hostname "pc";
}
)"};

/// The colours of a desktop that matter.
struct Scheme
{
    const char *name;
    const char *window;
    const char *base;
    const char *button;
    const char *text;
    const char *highlight;
    const char *highlightedText;
};

const Scheme breezeLight{"Breeze light", "#eff0f1", "#fcfcfc", "#eff0f1", "#232629", "#3daee9", "#fcfcfc"};
const Scheme breezeDark{"Breeze dark", "#31363b", "#232629", "#31363b", "#eff0f1", "#3daee9", "#eff0f1"};
const Scheme fusionDark{"Fusion dark", "#353535", "#2a2a2a", "#353535", "#ffffff", "#2a82da", "#000000"};

QPalette paletteOf(const Scheme &scheme)
{
    const QColor text{QLatin1String{scheme.text}};
    QPalette palette{QLatin1String{scheme.button}, QLatin1String{scheme.window}};
    for (const QPalette::ColorRole role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(role, text);
    palette.setColor(QPalette::Base, QLatin1String{scheme.base});
    palette.setColor(QPalette::AlternateBase, QLatin1String{scheme.window});
    palette.setColor(QPalette::Highlight, QLatin1String{scheme.highlight});
    palette.setColor(QPalette::HighlightedText, QLatin1String{scheme.highlightedText});
    QColor faint{text};
    faint.setAlpha(128);
    palette.setColor(QPalette::PlaceholderText, faint);
    return palette;
}

double luminance(QRgb colour)
{
    const auto linear = [](int channel) {
        const double value{channel / 255.0};
        return value <= 0.03928 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(qRed(colour)) + 0.7152 * linear(qGreen(colour)) + 0.0722 * linear(qBlue(colour));
}

double contrast(QRgb one, QRgb other)
{
    const double first{luminance(one)};
    const double second{luminance(other)};
    return (std::max(first, second) + 0.05) / (std::min(first, second) + 0.05);
}

/// How often each colour occurs, the most frequent first: what is behind everything else.
std::vector<std::pair<int, QRgb>> coloursOf(const QImage &picture)
{
    std::map<QRgb, int> counts;
    for (int y{0}; y < picture.height(); ++y) {
        for (int x{0}; x < picture.width(); ++x)
            ++counts[picture.pixel(x, y)];
    }
    std::vector<std::pair<int, QRgb>> colours;
    for (const auto &[colour, count] : counts)
        colours.emplace_back(count, colour);
    std::sort(colours.rbegin(), colours.rend());
    return colours;
}

/// That of the middle of the strokes, which are blurred at their edges.
double textContrast(const QImage &picture)
{
    const auto colours = coloursOf(picture);
    double most{1.0};
    for (const auto &[count, colour] : colours)
        most = std::max(most, contrast(colour, colours.front().second));
    return most;
}

/// The least of all colours that areas are filled with, whose edges are blurred.
double iconContrast(const QImage &picture)
{
    const QRgb behind{coloursOf(picture).front().second};
    double least{21.0};
    bool isBlank{true};
    for (int y{1}; y < picture.height() - 1; ++y) {
        for (int x{1}; x < picture.width() - 1; ++x) {
            const QRgb colour{picture.pixel(x, y)};
            const std::array around{picture.pixel(x - 1, y), picture.pixel(x + 1, y), picture.pixel(x, y - 1),
                                    picture.pixel(x, y + 1)};
            const bool isInside{std::all_of(around.begin(), around.end(), [&](QRgb other) { return other == colour; })};
            if (colour == behind || !isInside)
                continue;
            least = std::min(least, contrast(colour, behind));
            isBlank = false;
        }
    }
    return isBlank ? 1.0 : least;
}

/// Places in a window, by what is there.
using Places = std::vector<std::pair<QString, QRect>>;

QRect in(const QWidget &window, const QWidget *widget, const QRect &rectangle)
{
    return {widget->mapTo(&window, rectangle.topLeft()), rectangle.size()};
}

/// The cells that are not selected, whose colours are the desktop's affair.
void addCells(Places &places, const QWidget &window, const QAbstractItemView &view, const QModelIndex &parent = {})
{
    const QAbstractItemModel &model{*view.model()};
    for (int row{0}; row < model.rowCount(parent); ++row) {
        for (int column{0}; column < model.columnCount(parent); ++column) {
            const QModelIndex index{model.index(row, column, parent)};
            const QRect cell{view.visualRect(index)};
            const bool isShown{!index.data().toString().trimmed().isEmpty() && !cell.isEmpty()};
            if (isShown && !view.selectionModel()->isSelected(index))
                places.emplace_back(index.data().toString(), in(window, view.viewport(), cell));
        }
        addCells(places, window, view, model.index(row, 0, parent));
    }
}

void addHeader(Places &places, const QWidget &window, const QHeaderView &header)
{
    for (int section{0}; section < header.count(); ++section) {
        const QRect place{header.sectionViewportPosition(section), 0, header.sectionSize(section), header.height()};
        places.emplace_back(text("header %1").arg(section),
                            in(window, header.viewport(), place.adjusted(3, 3, -3, -3)));
    }
}

/// Every text in the window's frame, beside those of the tab in front.
Places frameTexts(const FMain &window)
{
    Places places;
    const auto *bar = driver::find<QTabBar>(window);
    for (int tab{0}; tab < bar->count(); ++tab)
        places.emplace_back(bar->tabText(tab), in(window, bar, bar->tabRect(tab).adjusted(6, 6, -6, -4)));
    const QMenuBar *menus{window.menuBar()};
    for (QAction *action : menus->actions())
        places.emplace_back(action->text(), in(window, menus, menus->actionGeometry(action)));
    const auto *state = driver::find<QLabel>(*window.statusBar());
    places.emplace_back(state->text(), in(window, state, state->rect()));
    return places;
}

QString described(const QString &what, double measured) { return text("%1: %2").arg(what).arg(measured, 0, 'f', 2); }

/// The places whose contrast is too low.
QString tooFaint(const QImage &picture, const Places &places, double (*measure)(const QImage &))
{
    QStringList faint;
    for (const auto &[name, place] : places) {
        const double measured{measure(picture.copy(place))};
        if (measured < leastContrast)
            faint.append(described(name, measured));
    }
    return faint.join(text(", "));
}

/// The icons of buttons that can be used now; the others are to be seen as faint.
Places buttonIcons(const QWidget &window)
{
    Places places;
    for (const auto *button : window.findChildren<QToolButton *>()) {
        if (!button->isVisible() || !button->isEnabled() || button->icon().isNull())
            continue;
        QRect icon{QPoint{}, button->iconSize()};
        icon.moveCenter(button->rect().center());
        places.emplace_back(button->icon().name(), in(window, button, icon.adjusted(-1, -1, 1, 1)));
    }
    return places;
}

/// Has every button look as it does under the mouse, pressed or not.
void touchButtons(const QWidget &window, bool arePressed)
{
    for (auto *button : window.findChildren<QToolButton *>()) {
        button->setAttribute(Qt::WA_UnderMouse);
        button->setDown(arePressed);
    }
}

} // namespace

Q_DECLARE_METATYPE(Scheme)

class PalettesTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { QApplication::setStyle(text("Fusion")); }
    void cleanup() { m_site.reset(); }

    void textsAreLegible_data() { addSchemes(); }
    void textsAreLegible();
    void searchIsLegible_data() { addSchemes(); }
    void searchIsLegible();
    void buttonsAreLegible_data() { addSchemes(); }
    void buttonsAreLegible();
    void buttonsInUseAreLegible_data() { addSchemes(); }
    void buttonsInUseAreLegible();
    void selectedTextsAreLegible_data() { addSchemes(); }
    void selectedTextsAreLegible();
    void bundledIconsAreLegible_data() { addSchemes(); }
    void bundledIconsAreLegible();
    void installedIconsAreLegible_data() { addSchemes(); }
    void installedIconsAreLegible();
    void changeOfThePaletteIsFollowed_data();
    void changeOfThePaletteIsFollowed();

private:
    static void addSchemes();
    /// The palette, with no icons but those that are bundled and those in the folders.
    static void use(const Scheme &scheme, const QStringList &iconFolders = {});
    void open();
    void search(const QString &text) const;
    QLineEdit *field() const { return driver::find<QLineEdit>(m_site->window(), text("searchLease")); }
    QImage picture() const { return m_site->window().grab().toImage(); }
    double fieldContrast() const;

    std::unique_ptr<TopologyWindow> m_site;
};

void PalettesTest::addSchemes()
{
    QTest::addColumn<Scheme>("scheme");
    for (const Scheme &scheme : {breezeLight, breezeDark, fusionDark})
        QTest::addRow("%s", scheme.name) << scheme;
}

void PalettesTest::use(const Scheme &scheme, const QStringList &iconFolders)
{
    QApplication::setPalette(paletteOf(scheme));
    QIcon::setThemeSearchPaths(iconFolders);
    QIcon::setThemeName({});
    orvInit("1", "text");
}

void PalettesTest::open()
{
    m_site = std::make_unique<TopologyWindow>(configuration);
    writeTestFile(paths::leases(), leases);
    m_site->window().resize(1000, 600);
}

void PalettesTest::search(const QString &text) const
{
    field()->setFocus();
    driver::retype(text);
    driver::find<QTableView>(m_site->window(), QStringLiteral("dhcpdLeaseTable"))->setFocus(); // and no cursor
}

double PalettesTest::fieldContrast() const
{
    return textContrast(picture().copy(in(m_site->window(), field(), field()->rect().adjusted(28, 4, -28, -4))));
}

void PalettesTest::textsAreLegible()
{
    QFETCH(Scheme, scheme);
    use(scheme);
    open();
    const FMain &window{m_site->window()};
    m_site->select({});
    Places topology{frameTexts(window)};
    addHeader(topology, window, *m_site->tree().header());
    addCells(topology, window, m_site->tree());
    QVERIFY(topology.size() > 15);
    QCOMPARE(tooFaint(picture(), topology, textContrast), QString{});

    clickTab(window, 1);
    const auto *table = driver::find<QTableView>(window, text("dhcpdLeaseTable"));
    QTRY_VERIFY(table->columnWidth(0) > 20);
    Places rows{frameTexts(window)};
    addHeader(rows, window, *table->horizontalHeader());
    addCells(rows, window, *table);
    QVERIFY(rows.size() > 15);
    QCOMPARE(tooFaint(picture(), rows, textContrast), QString{});
}

void PalettesTest::searchIsLegible()
{
    QFETCH(Scheme, scheme);
    use(scheme);
    open();
    clickTab(m_site->window(), 1);
    QVERIFY2(fieldContrast() >= leastContrast, qPrintable(described(text("placeholder"), fieldContrast())));
    search(text("pc"));
    QVERIFY2(fieldContrast() >= leastContrast, qPrintable(described(text("found"), fieldContrast())));
    search(text("nothing"));
    // On light palettes the red is that of the style sheet's name, deliberately; the description says the same.
    const double least{QColor{QLatin1String{scheme.base}}.lightness() < 128 ? leastContrast : 3.8};
    QVERIFY2(fieldContrast() >= least, qPrintable(described(text("not found"), fieldContrast())));
    search({});
    QVERIFY2(fieldContrast() >= leastContrast, qPrintable(described(text("placeholder again"), fieldContrast())));
}

void PalettesTest::buttonsAreLegible()
{
    QFETCH(Scheme, scheme);
    use(scheme);
    open();
    m_site->select({});
    const Places tools{buttonIcons(m_site->window())};
    QVERIFY(tools.size() >= 5);
    QCOMPARE(tooFaint(picture(), tools, textContrast), QString{});
    clickTab(m_site->window(), 1);
    search(text("pc"));
    const Places searching{buttonIcons(m_site->window())};
    QVERIFY(searching.size() >= 5);
    QTRY_COMPARE(tooFaint(picture(), searching, textContrast), QString{});
}

void PalettesTest::buttonsInUseAreLegible()
{
    QFETCH(Scheme, scheme);
    use(scheme);
    open();
    const FMain &window{m_site->window()};
    m_site->select({});
    for (const int tab : {0, 1}) {
        clickTab(window, tab);
        if (tab == 1)
            search(text("pc"));
        for (const bool arePressed : {false, true}) {
            touchButtons(window, arePressed);
            QVERIFY(buttonIcons(window).size() >= 5);
            QTRY_COMPARE(tooFaint(picture(), buttonIcons(window), textContrast), QString{});
        }
        touchButtons(window, false);
    }
}

// They have the desktop's colours, as legible as those are.
void PalettesTest::selectedTextsAreLegible()
{
    QFETCH(Scheme, scheme);
    use(scheme);
    open();
    const FMain &window{m_site->window()};
    const QRgb highlight{QColor{QLatin1String{scheme.highlight}}.rgb()};
    const double pair{contrast(QColor{QLatin1String{scheme.highlightedText}}.rgb(), highlight)};
    const double least{std::min(0.95 * pair, leastContrast)}; // the strokes of a short text may all be a little blurred
    // Around the current cell, the first, is the style's frame.
    const auto compareCell = [&](const QAbstractItemView &view, const QModelIndex &cell) {
        const QRect place{view.visualRect(cell) & view.viewport()->rect()};
        const QImage seen{picture().copy(in(window, view.viewport(), place))};
        QCOMPARE(coloursOf(seen).front().second, highlight);
        QVERIFY2(textContrast(seen) >= least, qPrintable(described(cell.data().toString(), textContrast(seen))));
    };
    for (const char *statement : {"default-lease-time", "shared-network", "subnet", "option", "host", "hardware"}) {
        m_site->select(text(statement));
        compareCell(m_site->tree(), m_site->tree().currentIndex().siblingAtColumn(1));
    }

    clickTab(window, 1);
    const auto *table = driver::find<QTableView>(window, text("dhcpdLeaseTable"));
    QTRY_VERIFY(table->columnWidth(0) > 20);
    const QModelIndex lease{table->model()->index(0, 0)};
    QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, table->visualRect(lease).center());
    for (int column{1}; column < table->model()->columnCount(); ++column)
        compareCell(*table, lease.siblingAtColumn(column));
}

void PalettesTest::bundledIconsAreLegible()
{
    QFETCH(Scheme, scheme);
    use(scheme);
    const QStringList names{QDir{text(":/icons/light/hicolor/scalable/actions")}.entryList()};
    QVERIFY(names.size() > 10);
    for (const char *behind : {scheme.window, scheme.base}) {
        QStringList faint;
        for (const QString &name : names) {
            QLabel label;
            QPalette palette{label.palette()};
            palette.setColor(QPalette::Window, QLatin1String{behind});
            label.setPalette(palette);
            label.setPixmap(QIcon::fromTheme(name.section(QLatin1Char{'.'}, 0, 0)).pixmap(256));
            const double measured{iconContrast(label.grab().toImage())};
            if (measured < leastContrast)
                faint.append(described(name, measured));
        }
        QCOMPARE(faint.join(text(", ")), QString{});
    }
}

void PalettesTest::installedIconsAreLegible()
{
    QFETCH(Scheme, scheme);
    const QString folder{text("/usr/share/icons")};
    if (!QDir{folder + text("/breeze-dark")}.exists())
        QSKIP("the package breeze-icon-theme is not installed");
    use(scheme, {folder});
    open();
    m_site->select(text("host")); // "Add subnet", whose icon is a picture in full colour there, is disabled now
    clickTab(m_site->window(), 1);
    search(text("pc"));
    QTRY_COMPARE(tooFaint(picture(), buttonIcons(m_site->window()), textContrast), QString{});
}

void PalettesTest::changeOfThePaletteIsFollowed_data()
{
    QTest::addColumn<Scheme>("before");
    QTest::addColumn<Scheme>("after");
    QTest::addColumn<QStringList>("folders");
    for (const auto &[before, after] : {std::pair{breezeLight, breezeDark}, std::pair{fusionDark, breezeLight}}) {
        QTest::addRow("%s, bundled icons", after.name) << before << after << QStringList{};
        QTest::addRow("%s, installed icons", after.name) << before << after << QStringList{text("/usr/share/icons")};
    }
}

void PalettesTest::changeOfThePaletteIsFollowed()
{
    QFETCH(Scheme, before);
    QFETCH(Scheme, after);
    QFETCH(QStringList, folders);
    if (!folders.isEmpty() && !QDir{folders.first() + text("/breeze-dark")}.exists())
        QSKIP("the package breeze-icon-theme is not installed");
    use(before, folders);
    open();
    clickTab(m_site->window(), 1);
    search(text("pc"));
    QVERIFY(!picture().isNull()); // everything has been drawn once
    QApplication::setPalette(paletteOf(after));
    QCoreApplication::processEvents();
    QVERIFY(fieldContrast() >= leastContrast);
    // Breeze has a picture in full colour for one command of the tool bar, which is disabled on this tab.
    QTRY_COMPARE(tooFaint(picture(), buttonIcons(m_site->window()), textContrast), QString{});
}

QTEST_MAIN(PalettesTest)
#include "tst_palettes.moc"
