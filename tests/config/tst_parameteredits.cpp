// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/editedmodel.h"
#include "tests/support/text.h"

#include <QTest>

namespace {

using Edit = EditCase::Edit;

Edit addLeaseTime(const char *keyword, const char *seconds, bool isAdded = true)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) {
        QCOMPARE(model.addLeaseTime(text(keyword), text(seconds), parent), isAdded);
    };
}

Edit addDefaultLeaseTime(const char *seconds, bool isAdded = true)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) {
        QCOMPARE(model.addDefaultLeaseTime(text(seconds), parent), isAdded);
    };
}

Edit addMaxLeaseTime(const char *seconds, bool isAdded = true)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) {
        QCOMPARE(model.addMaxLeaseTime(text(seconds), parent), isAdded);
    };
}

Edit addStaticRoutes(const QStringList &routes, bool ms)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) { model.addStaticRoutes(routes, ms, parent); };
}

struct AddressListOption
{
    const char *name;
    ValueOperation add;
    const char *refusal;
};

const AddressListOption addressListOptions[]{
    {"routers", &DhcpdConfigModel::addRouters, "Error adding gateways. Can not add to '%1'"},
    {"domain-name-servers", &DhcpdConfigModel::addDnsServers, "Error adding DNS servers. Can not add to '%1'"},
    {"ntp-servers", &DhcpdConfigModel::addNtpServers, "Error adding NTP servers address. Can not add to '%1'"},
};

const QStringList oneRoute{text("24"), text("192,168,1,0"), text("192,168,1,1")};
constexpr auto routeValue = "24, 192,168,1,0, 192,168,1,1";

struct RouteOption
{
    bool ms;
    const char *name;
    const char *otherName;
    const char *definition;
};

const RouteOption routeOptions[]{
    {false, "classless-static-routes", "ms-classless-static-routes", "code 121 = array of unsigned integer 8"},
    {true, "ms-classless-static-routes", "classless-static-routes", "code 249 = array of unsigned integer 8"},
};

// Every kind of declaration: a value fits into any.
constexpr const char *holders[]{"", "top", "subnet", "host", "range", "group", "shared-network"};
constexpr auto everyHolder = "subnet { } host { } range; group { } shared-network { }";

} // namespace

class ParameterEditsTest final : public QObject
{
    Q_OBJECT

private slots:
    void changes_data();
    void changes();
    void addsToEveryDeclaration_data();
    void addsToEveryDeclaration();
    void refuses_data();
    void refuses();
    void writesWhatIsPutIntoAFixedAddress();
};

void ParameterEditsTest::changes_data()
{
    QTest::addColumn<EditCase>("edit");

    const auto row = [](const QString &name, const QString &before, const char *target, const Edit &edit,
                        const QString &after, int resets) {
        QTest::addRow("%s", qPrintable(name)) << EditCase{before, text(target), edit, after, resets};
    };
    const auto adds = [&row](const char *name, const char *before, const Edit &edit, const char *after) {
        row(text(name), text(before), "", edit, text(after), 1);
    };
    const auto replaces = [&row](const char *name, const char *before, const Edit &edit, const char *after) {
        row(text(name), text(before), "", edit, text(after), 0);
    };

    adds("default lease time", "a { }", addDefaultLeaseTime("600"), "default-lease-time|600\na| {\n");
    adds("max lease time", "default-lease-time 5;", addMaxLeaseTime("600"),
         "default-lease-time|5\nmax-lease-time|600\n");
    adds("lease time of any keyword", "default-lease-time 5;", addLeaseTime("min-lease-time", "1"),
         "default-lease-time|5\nmin-lease-time|1\n");
    adds("lease time as typed", "", addDefaultLeaseTime("0600"), "default-lease-time|0600\n");
    adds("long lease time", "", addDefaultLeaseTime("4294967295"), "default-lease-time|4294967295\n");
    adds("lease time beside a declaration's", "a { max-lease-time 5; }", addMaxLeaseTime("6"),
         "max-lease-time|6\na| {\n max-lease-time|5\n");
    replaces("lease time", "max-lease-time 1; Max-Lease-Time 2 3 4; max-lease-time 3;", addMaxLeaseTime("007"),
             "max-lease-time|007\nMax-Lease-Time|2|3|4\nmax-lease-time|3\n");
    replaces("lease time of several words", "a b; Default-Lease-Time 2 3 4;", addDefaultLeaseTime("600"),
             "a|b\nDefault-Lease-Time|600\n");
    replaces("lease time without value", "default-lease-time;", addDefaultLeaseTime("600"), "default-lease-time|600\n");

    for (const auto &[name, add, refusal] : addressListOptions) {
        const QString option{QStringLiteral("option|%1|").arg(text(name))};
        row(text(name), QString{}, "", addValue(add, "10.0.0.1, 10.0.0.2"), option + text("10.0.0.1, 10.0.0.2\n"), 1);
        row(text(name) + text(": as typed"), QString{}, "", addValue(add, "10.1,0.0.0.0"),
            option + text("10.1,0.0.0.0\n"), 1);
        row(text(name) + text(": replaced"),
            QStringLiteral("option x y; Option %1 10.0.0.1, 10.0.0.2; option %1 10.0.0.3;").arg(text(name).toUpper()),
            "", addValue(add, "10.0.0.4,10.0.0.5"),
            QStringLiteral("option|x|y\nOption|%1|10.0.0.4,10.0.0.5\noption|%1|10.0.0.3\n").arg(text(name).toUpper()),
            0);
        row(text(name) + text(": no option"), QStringLiteral("deny %1;").arg(text(name)), "", addValue(add, "10.0.0.1"),
            QStringLiteral("deny|%1\n").arg(text(name)) + option + text("10.0.0.1\n"), 1);
        row(text(name) + text(": without value"), QStringLiteral("option %1;").arg(text(name)), "",
            addValue(add, "10.0.0.1"), option + text("10.0.0.1\n"), 0);
    }

    const auto domainName = [](const char *name) { return addValue(&DhcpdConfigModel::addDomainName, name); };
    adds("domain name", "", domainName("\"example.org\""), "option|domain-name|\"example.org\"\n");
    adds("domain name beside the servers", "option domain-name-servers 10.0.0.1;", domainName("\"example.org\""),
         "option|domain-name-servers|10.0.0.1\noption|domain-name|\"example.org\"\n");
    replaces("domain name", "option domain-name \"a.org\";", domainName("\"b.org\""),
             "option|domain-name|\"b.org\"|\n");
    replaces("domain name again", "option domain-name \"a.org\" ;", domainName("\"b.org\""),
             "option|domain-name|\"b.org\"|\n");
    replaces("domain name of several words", R"(option domain-name "a b c"; option domain-name "d";)",
             domainName("\"b.org\""), "option|domain-name|\"b.org\"|\noption|domain-name|\"d\"\n");

    for (const auto &[ms, name, otherName, definition] : routeOptions) {
        const QString label{text(name) + text(": ")};
        const QString definitionWords{QStringLiteral("option|%1|%2\n").arg(text(name), text(definition))};
        const QString value{QStringLiteral("option|%1|%2\n").arg(text(name), text(routeValue))};
        const QString definitionText{QStringLiteral("option %1 code; ").arg(text(name))};
        const QString definitionRead{QStringLiteral("option|%1|code\n").arg(text(name))};
        const Edit add{addStaticRoutes(oneRoute, ms)};

        row(label + text("all network"), QString{}, "", add, definitionWords + value, 1);
        row(label + text("top"), QString{}, "top", add, definitionWords + value, 1);
        row(label + text("subnet"), text("subnet { }"), "subnet", add, definitionWords + text("subnet| {\n ") + value,
            1);
        row(label + text("deep"), text("a { b { } }"), "b", add,
            text("a| {\n ") + definitionWords + text(" b| {\n  ") + value, 1);
        row(label + text("defined in the declaration"), QStringLiteral("subnet { %1 }").arg(definitionText), "subnet",
            add, text("subnet| {\n ") + definitionRead + QLatin1Char{' '} + value, 1);
        row(label + text("defined around it"), definitionText.toUpper() + text("subnet { }"), "subnet", add,
            definitionRead.toUpper() + text("subnet| {\n ") + value, 1);
        row(label + text("defined too far out"), definitionText + text("a { b { } }"), "b", add,
            definitionRead + text("a| {\n ") + definitionWords + text(" b| {\n  ") + value, 1);
        row(label + text("only the other is defined"), QStringLiteral("option %1 code; a { }").arg(text(otherName)),
            "a", add,
            QStringLiteral("option|%1|code\n").arg(text(otherName)) + definitionWords + text("a| {\n ") + value, 1);
        row(label + text("value again"), definitionText, "", add, definitionRead + value, 1);
        row(label + text("no option"), QStringLiteral("deny %1;").arg(text(name)), "", add,
            QStringLiteral("deny|%1\n").arg(text(name)) + definitionWords + value, 1);
        row(label + text("two routes"), definitionText, "", addStaticRoutes(oneRoute + oneRoute, ms),
            definitionRead + value.trimmed() + text(", ") + text(routeValue) + QLatin1Char{'\n'}, 1);
        row(label + text("route as it is"), definitionText, "", addStaticRoutes({QString{}}, ms),
            definitionRead + QStringLiteral("option|%1|\n").arg(text(name)), 1);
        row(label + text("as a keyword"), QStringLiteral("%1 a b c;").arg(text(name).toUpper()), "", add,
            QStringLiteral("%1|a|%2||b|c\n").arg(text(name).toUpper(), text(name)), 0);
    }
}

void ParameterEditsTest::changes()
{
    QFETCH(EditCase, edit);
    verifyEdit(edit);
}

void ParameterEditsTest::addsToEveryDeclaration_data()
{
    QTest::addColumn<QString>("target");
    QTest::addColumn<EditCase::Edit>("edit");
    QTest::addColumn<int>("added");

    for (const char *holder : holders) {
        const auto row = [holder](const char *name, const Edit &edit, int added) {
            QTest::addRow("%s: %s", holder, name) << text(holder) << edit << added;
        };
        row("default lease time", addDefaultLeaseTime("1"), 1);
        row("max lease time", addMaxLeaseTime("1"), 1);
        for (const auto &[name, add, refusal] : addressListOptions)
            row(name, addValue(add, "10.0.0.1"), 1);
        row("domain name", addValue(&DhcpdConfigModel::addDomainName, "\"a.org\""), 1);
        row("static routes", addStaticRoutes(oneRoute, false), 2);
    }
}

void ParameterEditsTest::addsToEveryDeclaration()
{
    QFETCH(QString, target);
    QFETCH(EditCase::Edit, edit);
    QFETCH(int, added);
    EditedModel edited{text(everyHolder)};
    const QString::size_type linesBefore{edited.outline().count(QLatin1Char{'\n'})};
    edit(edited.model(), edited.find(target));
    edited.verifyChange(1);
    QCOMPARE(edited.outline().count(QLatin1Char{'\n'}) - linesBefore, added);
    verifyLinks(edited.model());
}

void ParameterEditsTest::refuses_data()
{
    QTest::addColumn<Refusal>("refusal");

    const auto row = [](const QString &name, const char *target, const Edit &edit, const QString &error) {
        const QString before{
            text("a b; default-lease-time 5; option routers 10.0.0.1; option domain-name \"a.org\"; c { }")};
        QTest::addRow("%s", qPrintable(name)) << Refusal{before, text(target), edit, error};
    };

    // The kind of the parent is checked before the value.
    for (const char *seconds : {"5", "0"}) {
        row(text("lease time in a parameter: ") + text(seconds), "a", addDefaultLeaseTime(seconds, false),
            text("Error adding lease time. Can not add to 'a'"));
    }
    for (const char *seconds : {"0", "-5", "", "abc", "600 s", "1.5", "0x10", "99999999999999999999"}) {
        const QString error{QStringLiteral("Invalid time in seconds '%1'").arg(text(seconds))};
        row(text("default lease time: ") + text(seconds), "", addDefaultLeaseTime(seconds, false), error);
        row(text("max lease time: ") + text(seconds), "c", addMaxLeaseTime(seconds, false), error);
    }

    for (const auto &[name, add, refusal] : addressListOptions) {
        for (const char *list : {"10.0.0.1", "abc"}) {
            row(text(name) + text(" in a parameter: ") + text(list), "a", addValue(add, list),
                text(refusal).arg(QLatin1Char{'a'}));
        }
        for (const char *list : {"", "abc", "10.0.0.1,", "10.0.0.1,,10.0.0.2", "10.0.0.1;10.0.0.2", "127.0.0.1",
                                 "10.0.0.1, 255.255.255.255", "10.0.0.256"}) {
            row(text(name) + text(": ") + text(list), "", addValue(add, list),
                QStringLiteral("Invalid one or more IP in list '%1'").arg(text(list)));
        }
    }

    for (const char *name : {"\"a.org\"", "abc"}) {
        row(text("domain name in a parameter: ") + text(name), "a", addValue(&DhcpdConfigModel::addDomainName, name),
            text("Error adding domain name. Can not add to 'a'"));
    }
    for (const char *name : {"", "a.org", "\"a\"", "\"a.abcdefg\"", "\"a.org", "\"-a.org\"", "\"a.org\" "}) {
        row(text("domain name: ") + text(name), "", addValue(&DhcpdConfigModel::addDomainName, name),
            QStringLiteral("Invalid domain name '%1'").arg(text(name)));
    }

    for (const bool ms : {false, true}) {
        for (const QStringList &routes : {oneRoute, QStringList{}}) {
            row(QStringLiteral("static routes in a parameter: %1 %2").arg(ms).arg(routes.size()), "a",
                addStaticRoutes(routes, ms), text("Error adding static route. Can not add static rout to 'a'"));
        }
        row(QStringLiteral("no static routes: %1").arg(ms), "", addStaticRoutes({}, ms),
            text("Error adding static route. Static route parametrs can not be empty."));
    }
}

void ParameterEditsTest::refuses()
{
    QFETCH(Refusal, refusal);
    verifyRefusal(refusal);
}

void ParameterEditsTest::writesWhatIsPutIntoAFixedAddress()
{
    DhcpdConfigModel model{QStringList{text("Topology"), text("Value")}};
    QVERIFY(model.parse(text("host a {\nfixed-address 10.0.0.5;\n}\n")));
    const QModelIndex address{model.index(0, 0, model.index(0, 0, model.index(0, 0)))};
    QCOMPARE(model.statementFor(address)->keyword(), text("fixed-address"));
    model.addNtpServers(text("10.0.0.4"), address);
    QCOMPARE(model.fileContent(), QByteArray{"host a {\n    fixed-address 10.0.0.5 {\n"
                                             "        option ntp-servers 10.0.0.4;\n    }\n}\n"});
}

QTEST_GUILESS_MAIN(ParameterEditsTest)
#include "tst_parameteredits.moc"
