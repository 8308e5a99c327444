// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/domaininputdialog.h"
#include "dialogs/hostinputdialog.h"
#include "dialogs/ipinputdialog.h"
#include "dialogs/macinputdialog.h"
#include "dialogs/multipleipinputdialog.h"
#include "dialogs/patterns.h"
#include "dialogs/rangeinputdialog.h"
#include "dialogs/sharednetworkinputdialog.h"
#include "dialogs/statementinputdialog.h"
#include "dialogs/staticrouteinputdialog.h"
#include "dialogs/subnetinputdialog.h"
#include "dialogs/timeinputdialog.h"
#include "tests/support/contexttranslator.h"
#include "tests/support/dialogdriver.h"

#include <QtWidgets>

#include <memory>

namespace {

using Maker = std::unique_ptr<QDialog> (*)();
using Pattern = const QRegularExpression &(*)();

template<typename Dialog>
std::unique_ptr<QDialog> make()
{
    return std::make_unique<Dialog>();
}

/// Installs a translator and a font while it lives.
class Surroundings final
{
public:
    Surroundings(QTranslator *translator, double enlargement)
        : m_translator{translator}
        , m_font{QApplication::font()}
    {
        QCoreApplication::installTranslator(m_translator);
        QFont font{m_font};
        font.setPointSizeF(font.pointSizeF() * enlargement);
        QApplication::setFont(font);
    }
    ~Surroundings()
    {
        QApplication::setFont(m_font);
        QCoreApplication::removeTranslator(m_translator);
    }
    Q_DISABLE_COPY_MOVE(Surroundings)

private:
    QTranslator *m_translator;
    QFont m_font;
};

int roomForText(const QLineEdit &field)
{
    QStyleOptionFrame option;
    option.initFrom(&field);
    option.lineWidth = field.style()->pixelMetric(QStyle::PM_DefaultFrameWidth, &option, &field);
    constexpr int marginsAroundText{4};
    return field.style()->subElementRect(QStyle::SE_LineEditContents, &option, &field).width() - marginsAroundText;
}

QStringList itemNames(const QLayout &layout)
{
    QStringList names;
    for (int i{0}; i < layout.count(); ++i) {
        QLayoutItem *item{layout.itemAt(i)};
        if (item->spacerItem())
            names.append(QStringLiteral("(spacer)"));
        else
            names.append(item->widget() ? item->widget()->objectName() : item->layout()->objectName());
    }
    return names;
}

QStringList names(const char *list) { return QString::fromLatin1(list).split(QLatin1Char{' '}, Qt::SkipEmptyParts); }

} // namespace

Q_DECLARE_METATYPE(Maker)
Q_DECLARE_METATYPE(Pattern)

class DialogFormsTest final : public QObject
{
    Q_OBJECT

private slots:
    void everyDialog_data();
    void everyDialog();
    void labelsAndFields_data();
    void labelsAndFields();
    void layouts_data();
    void layouts();
    void otherTexts_data();
    void otherTexts();
    void validators_data();
    void validators();
    void rangeFieldsShareOneValidator();
    void macMasks_data();
    void macMasks();
    void routeTable();
    void statementEditor();
    void tabGoesInReadingOrder_data();
    void tabGoesInReadingOrder();
    void screenReaderSaysEveryField_data();
    void screenReaderSaysEveryField();
    void fieldsShowWholeTexts_data();
    void fieldsShowWholeTexts();
    void routeColumnsShowWholeAddresses();
};

void DialogFormsTest::everyDialog_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<bool>("asks");
    QTest::addRow("subnet") << Maker{make<SubnetInputDialog>} << false;
    QTest::addRow("range") << Maker{make<RangeInputDialog>} << false;
    QTest::addRow("address") << Maker{make<IpInputDialog>} << false;
    QTest::addRow("addresses") << Maker{make<MultipleIpInputDialog>} << false;
    QTest::addRow("host") << Maker{make<HostInputDialog>} << false;
    QTest::addRow("mac") << Maker{make<MacInputDialog>} << false;
    QTest::addRow("domain") << Maker{make<DomainInputDialog>} << false;
    QTest::addRow("shared network") << Maker{make<SharedNetworkInputDialog>} << false;
    QTest::addRow("time") << Maker{make<TimeInputDialog>} << false;
    QTest::addRow("static routes") << Maker{make<StaticRouteInputDialog>} << true;
    QTest::addRow("statement") << Maker{make<StatementInputDialog>} << false;
}

void DialogFormsTest::everyDialog()
{
    QFETCH(Maker, maker);
    QFETCH(bool, asks);
    const QDialogButtonBox::StandardButton acceptButton{asks ? QDialogButtonBox::Yes : QDialogButtonBox::Save};
    ContextTranslator language;

    for (const double enlargement : {1.0, 1.5}) {
        const Surroundings surroundings{enlargement > 1.0 ? &language : nullptr, enlargement};
        const auto dialog = maker();
        dialog->setResult(QDialog::Accepted);
        const QString className{QString::fromLatin1(dialog->metaObject()->className())};
        QCOMPARE(dialog->windowTitle(),
                 enlargement > 1.0 ? className + QStringLiteral("|Dialog") : QStringLiteral("Dialog"));
        driver::open(*dialog);

        auto *buttons = driver::find<QDialogButtonBox>(*dialog, QStringLiteral("buttonBox"));
        QCOMPARE(buttons->orientation(), Qt::Horizontal);
        QVERIFY(buttons->centerButtons());
        QCOMPARE(buttons->standardButtons(), acceptButton | QDialogButtonBox::Cancel);
        for (const QPushButton *button : dialog->findChildren<QPushButton *>())
            QCOMPARE(button->isDefault(), button == buttons->button(acceptButton));

        constexpr QSize leastOfWindows{200, 0}; // to Qt, where the layout can grow sideways only
        QCOMPARE(dialog->size(), dialog->sizeHint().expandedTo(dialog->minimumSizeHint()).expandedTo(leastOfWindows));
        for (const QWidget *widget : dialog->findChildren<QWidget *>()) {
            if (qobject_cast<const QLabel *>(widget) || qobject_cast<const QAbstractButton *>(widget))
                QVERIFY2(widget->width() >= widget->sizeHint().width(), qPrintable(widget->objectName()));
        }
        driver::press(Qt::Key_Escape);
        QVERIFY(!dialog->isVisible());
        QCOMPARE(dialog->result(), int{QDialog::Rejected});

        const auto another = maker();
        another->setResult(QDialog::Accepted);
        driver::open(*another);
        driver::click(*another, QDialogButtonBox::Cancel);
        QVERIFY(!another->isVisible());
        QCOMPARE(another->result(), int{QDialog::Rejected});
    }
}

void DialogFormsTest::labelsAndFields_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("label");
    QTest::addColumn<QString>("field");
    QTest::addColumn<QString>("fieldClass");
    const auto add = [](const char *dialog, Maker maker, const char *text, const char *label, const char *field,
                        const char *fieldClass = "QLineEdit") {
        QTest::addRow("%s, %s %s", dialog, text, field)
            << maker << QString::fromLatin1(text) << QString::fromLatin1(label) << QString::fromLatin1(field)
            << QString::fromLatin1(fieldClass);
    };
    add("subnet", make<SubnetInputDialog>, "Address:", "addressLabel", "address");
    add("subnet", make<SubnetInputDialog>, "Netmask:", "netmaskLabel", "netmask");
    add("range", make<RangeInputDialog>, "Start IP:", "startLabel", "startIP");
    add("range", make<RangeInputDialog>, "End IP:", "endLabel", "endIP");
    add("address", make<IpInputDialog>, "IP:", "ipLabel", "");
    add("host", make<HostInputDialog>, "Name:", "nameLabel", "hostName");
    add("host", make<HostInputDialog>, "MAC address:", "macLabel", "hostMac");
    add("host", make<HostInputDialog>, "Fixed IP:", "ipLabel", "hostIp");
    add("mac", make<MacInputDialog>, "MAC address:", "macLabel", "");
    add("domain", make<DomainInputDialog>, "Domain name:", "domainLabel", "domainName");
    add("shared network", make<SharedNetworkInputDialog>, "Name:", "", "name");
    add("time", make<TimeInputDialog>, "Mounth:", "mounthLabel", "mounth", "QSpinBox");
    add("time", make<TimeInputDialog>, "Days:", "daysLabel", "days", "QSpinBox");
    add("time", make<TimeInputDialog>, ":", "minutesLabel", "minutes", "QSpinBox");
    add("time", make<TimeInputDialog>, ":", "secondsLabel", "seconds", "QSpinBox");
    add("statement", make<StatementInputDialog>, "Attributes:", "attrsLabel", "attributes", "QTextEdit");
}

void DialogFormsTest::labelsAndFields()
{
    QFETCH(Maker, maker);
    QFETCH(QString, text);
    QFETCH(QString, label);
    QFETCH(QString, field);
    QFETCH(QString, fieldClass);

    const auto dialog = maker();
    auto *labelWidget = driver::find<QLabel>(*dialog, label);
    QCOMPARE(labelWidget->text(), text);
    QVERIFY(labelWidget->buddy());
    QCOMPARE(QString::fromLatin1(labelWidget->buddy()->metaObject()->className()), fieldClass);
    if (field.isEmpty())
        QCOMPARE(dialog->findChildren<QLineEdit *>(), QList<QLineEdit *>{driver::find<QLineEdit>(*dialog)});
    else
        QCOMPARE(labelWidget->buddy()->objectName(), field);

    // Side by side, the label first.
    if (auto *form = dialog->findChild<QFormLayout *>()) {
        QFormLayout::ItemRole role{};
        int labelRow{-1};
        int fieldRow{-2};
        form->getWidgetPosition(labelWidget, &labelRow, &role);
        QCOMPARE(role, QFormLayout::LabelRole);
        form->getWidgetPosition(labelWidget->buddy(), &fieldRow, &role);
        QCOMPARE(role, QFormLayout::FieldRole);
        QCOMPARE(fieldRow, labelRow);
    }
}

void DialogFormsTest::layouts_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QString>("layout");
    QTest::addColumn<QStringList>("items");
    QTest::addColumn<bool>("top");
    const auto add = [](const char *dialog, Maker maker, const char *layout, const char *items, bool top = false) {
        QTest::addRow("%s, %s", dialog, layout) << maker << QString::fromLatin1(layout) << names(items) << top;
    };
    for (const auto &[dialog, maker] : {std::pair<const char *, Maker>{"subnet", make<SubnetInputDialog>},
                                        {"range", make<RangeInputDialog>},
                                        {"address", make<IpInputDialog>},
                                        {"addresses", make<MultipleIpInputDialog>},
                                        {"host", make<HostInputDialog>},
                                        {"mac", make<MacInputDialog>},
                                        {"domain", make<DomainInputDialog>},
                                        {"shared network", make<SharedNetworkInputDialog>}}) {
        add(dialog, maker, "verticalLayout_2", "verticalLayout buttonBox", true);
        add(dialog, maker, "verticalLayout", "formLayout");
    }
    add("addresses", make<MultipleIpInputDialog>, "formLayout", "ipGroup");
    add("time", make<TimeInputDialog>, "verticalLayout", "frame buttonBox", true);
    add("time", make<TimeInputDialog>, "horizontalLayout", "horizontalLayout_2 horizontalLayout_3");
    add("time", make<TimeInputDialog>, "horizontalLayout_2", "mounthLabel mounth line daysLabel days line_2");
    add("time", make<TimeInputDialog>, "horizontalLayout_3", "hours minutesLabel minutes secondsLabel seconds");
    add("static routes", make<StaticRouteInputDialog>, "verticalLayout", "StaticRouteGroup horizontalLayout buttonBox",
        true);
    add("static routes", make<StaticRouteInputDialog>, "StaticRouteLayout", "StaticRouteTable");
    add("static routes", make<StaticRouteInputDialog>, "horizontalLayout", "formLayout (spacer) checkBoxMS");
    add("static routes", make<StaticRouteInputDialog>, "formLayout", "addButton removeButton");
    add("statement", make<StatementInputDialog>, "verticalLayout_2", "verticalLayout buttonBox", true);
    add("statement", make<StatementInputDialog>, "verticalLayout", "attrsLabel attributes");
}

void DialogFormsTest::layouts()
{
    QFETCH(Maker, maker);
    QFETCH(QString, layout);
    QFETCH(QStringList, items);
    QFETCH(bool, top);
    const auto dialog = maker();
    const auto *found = dialog->findChild<QLayout *>(layout);
    QVERIFY(found);
    QCOMPARE(itemNames(*found), items);
    QCOMPARE(dialog->layout() == found, top);
}

void DialogFormsTest::otherTexts_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QString>("widget");
    QTest::addColumn<QString>("property");
    QTest::addColumn<QVariant>("value");
    const auto add = [](Maker maker, const char *widget, const char *property, const QVariant &value) {
        QTest::addRow("%s %s", widget, property)
            << maker << QString::fromLatin1(widget) << QString::fromLatin1(property) << value;
    };
    add(make<MultipleIpInputDialog>, "ipGroup", "title", QStringLiteral("IP addresses"));
    add(make<MultipleIpInputDialog>, "addButton", "text", QStringLiteral("Add"));
    add(make<MultipleIpInputDialog>, "addButton", "enabled", true);
    add(make<MultipleIpInputDialog>, "removeButton", "text", QStringLiteral("Remove"));
    add(make<MultipleIpInputDialog>, "removeButton", "enabled", false);
    add(make<StaticRouteInputDialog>, "removeButton", "text", QStringLiteral("Remove"));
    add(make<StaticRouteInputDialog>, "removeButton", "enabled", false);
    add(make<StaticRouteInputDialog>, "checkBoxMS", "text", QStringLiteral("Route for MS systems"));
    add(make<StaticRouteInputDialog>, "checkBoxMS", "checked", false);
    add(make<StatementInputDialog>, "attributes", "plainText", QString{});
    for (const auto &[name, maximum, suffix] : {std::tuple{"mounth", 12, ""},
                                                {"days", 31, ""},
                                                {"hours", 24, " h"},
                                                {"minutes", 60, " m"},
                                                {"seconds", 60, " s"}}) {
        add(make<TimeInputDialog>, name, "minimum", 0);
        add(make<TimeInputDialog>, name, "maximum", maximum);
        add(make<TimeInputDialog>, name, "suffix", QString::fromLatin1(suffix));
    }
    add(make<TimeInputDialog>, "frame", "frameShape", QFrame::StyledPanel);
    add(make<TimeInputDialog>, "frame", "frameShadow", QFrame::Raised);
    for (const char *line : {"line", "line_2"}) {
        add(make<TimeInputDialog>, line, "frameShape", QFrame::VLine);
        add(make<TimeInputDialog>, line, "frameShadow", QFrame::Sunken);
    }
}

void DialogFormsTest::otherTexts()
{
    QFETCH(Maker, maker);
    QFETCH(QString, widget);
    QFETCH(QString, property);
    QFETCH(QVariant, value);
    const auto dialog = maker();
    const QVariant actual{driver::find<QWidget>(*dialog, widget)->property(property.toLatin1().constData())};
    QVERIFY(actual.isValid());
    if (value.userType() == QMetaType::Int)
        QCOMPARE(actual.toInt(), value.toInt()); // of an enumeration, whose text Qt 6 takes from its names
    else
        QCOMPARE(actual.toString(), value.toString());
}

void DialogFormsTest::validators_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QString>("field");
    QTest::addColumn<Pattern>("pattern");
    QTest::addRow("subnet address") << Maker{make<SubnetInputDialog>} << QStringLiteral("address")
                                    << Pattern{patterns::subnet};
    QTest::addRow("netmask") << Maker{make<SubnetInputDialog>} << QStringLiteral("netmask")
                             << Pattern{patterns::netmask};
    QTest::addRow("range start") << Maker{make<RangeInputDialog>} << QStringLiteral("startIP")
                                 << Pattern{patterns::strictAddress};
    QTest::addRow("range end") << Maker{make<RangeInputDialog>} << QStringLiteral("endIP")
                               << Pattern{patterns::strictAddress};
    QTest::addRow("address") << Maker{make<IpInputDialog>} << QString{} << Pattern{patterns::looseAddress};
    QTest::addRow("host name") << Maker{make<HostInputDialog>} << QStringLiteral("hostName")
                               << Pattern{patterns::hostName};
    QTest::addRow("fixed address") << Maker{make<HostInputDialog>} << QStringLiteral("hostIp")
                                   << Pattern{patterns::looseAddress};
    QTest::addRow("domain") << Maker{make<DomainInputDialog>} << QStringLiteral("domainName")
                            << Pattern{patterns::domain};
    QTest::addRow("shared network") << Maker{make<SharedNetworkInputDialog>} << QStringLiteral("name")
                                    << Pattern{nullptr};
}

void DialogFormsTest::validators()
{
    QFETCH(Maker, maker);
    QFETCH(QString, field);
    QFETCH(Pattern, pattern);
    const auto dialog = maker();
    const QValidator *validator{driver::find<QLineEdit>(*dialog, field)->validator()};
    QCOMPARE(validator != nullptr, pattern != nullptr);
    if (!pattern)
        return;
    const auto *regularExpression = qobject_cast<const QRegularExpressionValidator *>(validator);
    QVERIFY(regularExpression);
    QCOMPARE(regularExpression->regularExpression(), pattern());
}

void DialogFormsTest::rangeFieldsShareOneValidator()
{
    const RangeInputDialog dialog;
    QCOMPARE(driver::find<QLineEdit>(dialog, QStringLiteral("startIP"))->validator(),
             driver::find<QLineEdit>(dialog, QStringLiteral("endIP"))->validator());
}

void DialogFormsTest::macMasks_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QString>("field");
    QTest::addRow("host") << Maker{make<HostInputDialog>} << QStringLiteral("hostMac");
    QTest::addRow("mac") << Maker{make<MacInputDialog>} << QString{};
}

void DialogFormsTest::macMasks()
{
    QFETCH(Maker, maker);
    QFETCH(QString, field);
    const auto dialog = maker();
    auto *edit = driver::find<QLineEdit>(*dialog, field);
    QCOMPARE(edit->inputMask(), QStringLiteral("HH:HH:HH:HH:HH:HH;_"));
    QCOMPARE(edit->displayText(), QStringLiteral("__:__:__:__:__:__"));
    driver::open(*dialog);
    edit->setFocus(Qt::TabFocusReason);
    QTest::keyClicks(edit, QStringLiteral("00xg1A2b"));
    QCOMPARE(edit->displayText(), QStringLiteral("00:1A:2b:__:__:__"));
    QVERIFY(!edit->hasAcceptableInput());
    QTest::keyClicks(edit, QStringLiteral("3c4d5e77"));
    QCOMPARE(edit->text(), QStringLiteral("00:1A:2b:3c:4d:5e"));
    QVERIFY(edit->hasAcceptableInput());
}

void DialogFormsTest::routeTable()
{
    const StaticRouteInputDialog dialog;
    const auto *table = driver::find<QTableView>(dialog, QStringLiteral("StaticRouteTable"));
    QCOMPARE(table->selectionBehavior(), QAbstractItemView::SelectRows);
    QCOMPARE(table->horizontalHeader()->count(), 3);
    for (int section{0}; section < 3; ++section)
        QCOMPARE(table->horizontalHeader()->sectionResizeMode(section), QHeaderView::Stretch);
    QVERIFY(driver::find<QGroupBox>(dialog, QStringLiteral("StaticRouteGroup"))->isAncestorOf(table));
}

void DialogFormsTest::statementEditor()
{
    StatementInputDialog dialog;
    QVERIFY(!dialog.isSizeGripEnabled());
    for (const char *layout : {"verticalLayout", "verticalLayout_2"}) {
        QCOMPARE(dialog.findChild<QLayout *>(QString::fromLatin1(layout))->sizeConstraint(),
                 QLayout::SetDefaultConstraint);
    }
    QVERIFY(!driver::find<QTextEdit>(dialog, QStringLiteral("attributes"))->acceptRichText());
}

void DialogFormsTest::tabGoesInReadingOrder_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QStringList>("fields");
    const auto add = [](const char *dialog, Maker maker, const char *fields) {
        QTest::addRow("%s", dialog) << maker << names(fields);
    };
    add("subnet", make<SubnetInputDialog>, "address netmask");
    add("range", make<RangeInputDialog>, "startIP endIP");
    add("address", make<IpInputDialog>, "ip");
    add("addresses", make<MultipleIpInputDialog>, "ipList addButton");
    add("host", make<HostInputDialog>, "hostName hostMac hostIp");
    add("mac", make<MacInputDialog>, "mac");
    add("domain", make<DomainInputDialog>, "domainName");
    add("shared network", make<SharedNetworkInputDialog>, "name");
    add("time", make<TimeInputDialog>, "mounth days hours minutes seconds");
    add("static routes", make<StaticRouteInputDialog>, "StaticRouteTable addButton checkBoxMS");
    add("statement", make<StatementInputDialog>, "attributes");
}

void DialogFormsTest::tabGoesInReadingOrder()
{
    QFETCH(Maker, maker);
    QFETCH(QStringList, fields);
    const auto dialog = maker();
    driver::open(*dialog);
    for (const QString &field : qAsConst(fields)) {
        QCOMPARE(QApplication::focusWidget()->objectName(), field);
        driver::press(Qt::Key_Tab);
    }
    const auto *box = driver::find<QDialogButtonBox>(*dialog, QStringLiteral("buttonBox"));
    QList<QAbstractButton *> buttons{box->buttons()};
    std::sort(buttons.begin(), buttons.end(), [](auto *left, auto *right) { return left->x() < right->x(); });
    for (const QAbstractButton *button : qAsConst(buttons)) {
        QCOMPARE(QApplication::focusWidget(), button);
        driver::press(Qt::Key_Tab);
    }
    QCOMPARE(QApplication::focusWidget()->objectName(), fields.constFirst());
}

void DialogFormsTest::screenReaderSaysEveryField_data() { tabGoesInReadingOrder_data(); }

void DialogFormsTest::screenReaderSaysEveryField()
{
    QFETCH(Maker, maker);
    QFETCH(QStringList, fields);
    const auto dialog = maker();
    QSet<QString> said;
    for (const QString &field : qAsConst(fields)) {
        const auto *interface = QAccessible::queryAccessibleInterface(driver::find<QWidget>(*dialog, field));
        const QString name{interface->text(QAccessible::Name)};
        QVERIFY2(std::any_of(name.begin(), name.end(), [](QChar sign) { return sign.isLetter(); }), qPrintable(field));
        said.insert(name);
    }
    QCOMPARE(said.size(), fields.size());
}

void DialogFormsTest::fieldsShowWholeTexts_data()
{
    QTest::addColumn<Maker>("maker");
    QTest::addColumn<QString>("field");
    QTest::addColumn<QString>("text");
    const auto add = [](Maker maker, const char *field, const char *text) {
        QTest::addRow("%s", text) << maker << QString::fromLatin1(field) << QString::fromLatin1(text);
    };
    add(make<SubnetInputDialog>, "address", "200.200.200.200/28");
    add(make<SubnetInputDialog>, "netmask", "255.255.255.254");
    add(make<RangeInputDialog>, "startIP", "200.200.200.200");
    add(make<RangeInputDialog>, "endIP", "200.200.200.201");
    add(make<IpInputDialog>, "", "200.200.200.202");
    add(make<HostInputDialog>, "hostName", "printer-first-floor.example.org");
    add(make<HostInputDialog>, "hostMac", "CC:CC:CC:CC:CC:CC");
    add(make<HostInputDialog>, "hostIp", "200.200.200.203");
    add(make<MacInputDialog>, "", "CC:CC:CC:CC:CC:CD");
    add(make<DomainInputDialog>, "domainName", "department.university.example");
    add(make<SharedNetworkInputDialog>, "name", "campus-network-second-floor");
}

void DialogFormsTest::fieldsShowWholeTexts()
{
    QFETCH(Maker, maker);
    QFETCH(QString, field);
    QFETCH(QString, text);
    for (const double enlargement : {1.0, 1.5}) {
        const Surroundings surroundings{nullptr, enlargement};
        const auto dialog = maker();
        auto *edit = driver::find<QLineEdit>(*dialog, field);
        edit->setText(text);
        driver::open(*dialog);
        dialog->resize(dialog->minimumSizeHint());
        QVERIFY(roomForText(*edit) >= edit->fontMetrics().horizontalAdvance(text));
    }
}

void DialogFormsTest::routeColumnsShowWholeAddresses()
{
    ContextTranslator language;
    for (const double enlargement : {1.0, 1.5}) {
        const Surroundings surroundings{enlargement > 1.0 ? &language : nullptr, enlargement};
        StaticRouteInputDialog dialog;
        dialog.setRoutes(QStringLiteral("31, 200,200,200,200, 200,200,200,201"), false);
        for (int row{0}; row < 20; ++row)
            dialog.handleAddStaticRoute();
        driver::open(dialog);
        dialog.resize(dialog.minimumSizeHint());
        const auto *table = driver::find<QTableView>(dialog, QStringLiteral("StaticRouteTable"));
        for (int column{0}; column < 3; ++column) {
            QVERIFY(table->columnWidth(column) >= table->sizeHintForIndex(table->model()->index(0, column)).width());
            QVERIFY(table->columnWidth(column) >= table->horizontalHeader()->sectionSizeHint(column));
        }
        QCOMPARE(table->horizontalScrollBar()->maximum(), 0);
    }
}

QTEST_MAIN(DialogFormsTest)
#include "tst_dialogforms.moc"
