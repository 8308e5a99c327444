// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/timeinputdialog.h"
#include "tests/support/dialogdriver.h"

#include <QApplication>
#include <QSpinBox>

#include <array>
#include <limits>

namespace {

constexpr std::array names{"mounth", "days", "hours", "minutes", "seconds"};

QList<int> shown(const TimeInputDialog &dialog)
{
    QList<int> values;
    for (const char *name : names)
        values.append(driver::find<QSpinBox>(dialog, QString::fromLatin1(name))->value());
    return values;
}

} // namespace

class TimeInputDialogTest final : public QObject
{
    Q_OBJECT

private slots:
    void startsAtZero();
    void distributesSeconds_data();
    void distributesSeconds();
    void addsUpWhatIsTyped_data();
    void addsUpWhatIsTyped();
    void aDayTypedAsHoursReopensAsADay();
};

void TimeInputDialogTest::startsAtZero() { QCOMPARE(TimeInputDialog{}.seconds(), QStringLiteral("0")); }

void TimeInputDialogTest::distributesSeconds_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<QList<int>>("parts");
    QTest::addColumn<int>("returned");
    const auto add = [](int value, const QList<int> &parts, int returned) {
        QTest::addRow("%d", value) << value << parts << returned;
    };
    add(0, {0, 0, 0, 0, 0}, 0);
    add(59, {0, 0, 0, 0, 59}, 59);
    add(600, {0, 0, 0, 10, 0}, 600);
    add(3600, {0, 0, 1, 0, 0}, 3600);
    add(86399, {0, 0, 23, 59, 59}, 86399);
    add(86400, {0, 1, 0, 0, 0}, 86400);
    add(2592000, {1, 0, 0, 0, 0}, 2592000);
    add(31536000, {12, 5, 0, 0, 0}, 31536000);
    add(33695999, {12, 29, 23, 59, 59}, 33695999);
    add(33696000, {12, 0, 0, 0, 0}, 31104000);
    add(40000000, {12, 12, 23, 6, 40}, 32224000);
    add(std::numeric_limits<int>::max(), {12, 15, 3, 14, 7}, 32411647);
    add(-1, {0, 0, 0, 0, 0}, 0);
    add(-90061, {0, 0, 0, 0, 0}, 0);
    add(std::numeric_limits<int>::min(), {0, 0, 0, 0, 0}, 0);
}

void TimeInputDialogTest::distributesSeconds()
{
    QFETCH(int, value);
    QFETCH(QList<int>, parts);
    QFETCH(int, returned);
    TimeInputDialog dialog;
    dialog.setSeconds(1);
    dialog.setSeconds(value);
    QCOMPARE(shown(dialog), parts);
    QCOMPARE(dialog.seconds(), QString::number(returned));
}

void TimeInputDialogTest::addsUpWhatIsTyped_data()
{
    QTest::addColumn<QStringList>("typed");
    QTest::addColumn<int>("returned");
    const auto add = [](const char *typed, int returned) {
        QTest::addRow("%s", typed) << QString::fromLatin1(typed).split(QLatin1Char{' '}) << returned;
    };
    add("0 0 24 0 0", 86400);
    add("0 0 0 60 60", 3660);
    add("1 2 3 4 5", 2592000 + 2 * 86400 + 3 * 3600 + 4 * 60 + 5);
    add("12 31 24 60 60", 33872460);
}

void TimeInputDialogTest::addsUpWhatIsTyped()
{
    QFETCH(QStringList, typed);
    QFETCH(int, returned);
    TimeInputDialog dialog;
    dialog.setSeconds(40000000);
    driver::open(dialog);
    for (int i{0}; i < typed.size(); ++i) {
        if (i > 0)
            driver::press(Qt::Key_Tab);
        driver::press(Qt::Key_A, Qt::ControlModifier);
        QTest::keyClicks(QApplication::focusWidget(), typed.at(i));
    }
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.seconds(), QString::number(returned));
}

void TimeInputDialogTest::aDayTypedAsHoursReopensAsADay()
{
    TimeInputDialog typed;
    driver::find<QSpinBox>(typed, QStringLiteral("hours"))->setValue(24);
    TimeInputDialog reopened;
    reopened.setSeconds(typed.seconds().toInt());
    QCOMPARE(shown(reopened), (QList<int>{0, 1, 0, 0, 0}));
}

QTEST_MAIN(TimeInputDialogTest)
#include "tst_timeinputdialog.moc"
