// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/leases/variedleases.h"

#include <QAbstractItemModel>
#include <QRandomGenerator>

#include <vector>

namespace {

template<typename List>
typename List::value_type oneOf(const List &list, QRandomGenerator &random)
{
    return list[static_cast<typename List::size_type>(random.bounded(static_cast<int>(list.size())))];
}

QByteArray hostName(QRandomGenerator &random)
{
    // Among them a sharp s, a long s, a Kelvin sign, Turkish i's, Deseret letters, and bytes that are Latin-1 only.
    static const std::vector<QByteArray> pieces{"host",
                                                "Host-",
                                                "HOST",
                                                "-",
                                                "7",
                                                "1.2",
                                                "\303\237",
                                                "SS",
                                                "\305\277",
                                                "\342\204\252",
                                                "k",
                                                "K",
                                                "S",
                                                "s",
                                                "\304\260\304\261",
                                                "iI",
                                                "\xE4\xDF",
                                                "\xC4",
                                                "\303\244",
                                                "\303\204",
                                                ".1",
                                                " 2026",
                                                "10.0.",
                                                "@",
                                                "`",
                                                "_",
                                                "\360\220\220\200",
                                                "\xF0\x90\x90\xA8",
                                                "UTC ",
                                                "\320\226",
                                                "\320\266",
                                                "1",
                                                QByteArray(300, 'x')};
    QByteArray name;
    for (int i{random.bounded(5)}; i >= 0; --i)
        name += oneOf(pieces, random);
    return name;
}

QByteArray address(QRandomGenerator &random)
{
    static const std::vector<QByteArray> unusual{"::1", "::ffff:10.0.0.1", "peer", "fe80::7"};
    if (random.bounded(40) == 0)
        return oneOf(unusual, random);
    const auto octet = [&random] { return QByteArray::number(random.bounded(256)); };
    return octet() + '.' + octet() + '.' + octet() + '.' + octet();
}

QByteArray time(QRandomGenerator &random)
{
    static const std::vector<QByteArray> unusual{"never", "6 2026/02/30 11:00:00", "6 2026/11/21",
                                                 "6 0001/01/01 00:00:00", "6 9999/12/31 23:59:59"};
    if (random.bounded(10) == 0)
        return oneOf(unusual, random);
    const auto number = [&random](int from, int to) {
        return QByteArray::number(random.bounded(from, to)).rightJustified(2, '0');
    };
    return "6 20" + number(19, 30) + '/' + number(1, 13) + '/' + number(1, 29) + ' ' + number(0, 24) + ':' +
           number(0, 60) + ':' + number(0, 60);
}

} // namespace

QByteArray variedLeaseFile(QRandomGenerator &random, int blocks)
{
    static const std::vector<QByteArray> states{"active", "free", "expired", "abandoned", "Sta\303\237e"};
    QByteArray text;
    for (int block{0}; block < blocks; ++block) {
        text += "lease " + address(random) + " {\n  starts " + time(random) + ";\n  ends " + time(random) + ";\n";
        text += "  binding state " + oneOf(states, random) + ";\n";
        if (random.bounded(5) != 0)
            text += "  hardware ethernet 00:0c:" + QByteArray::number(random.bounded(16, 256), 16) + ":0A:1b;\n";
        if (random.bounded(3) != 0)
            text += "  client-hostname \"" + hostName(random) + "\";\n";
        text += "}\n";
    }
    return text;
}

QStringList searchTexts(QRandomGenerator &random, const QAbstractItemModel &table, int count)
{
    static const QStringList hard{
        QString{},
        QStringLiteral(" "),
        QStringLiteral("  "),
        QStringLiteral("."),
        QStringLiteral(".."),
        QStringLiteral("1.1"),
        QStringLiteral(".1."),
        QStringLiteral("1.2.3.4"),
        QStringLiteral(".1.2.3.4"),
        QStringLiteral("256"),
        QStringLiteral("UTC "),
        QStringLiteral(" UTC 1"),
        QStringLiteral("\u00DF"), // sharp s
        QStringLiteral("\u1E9E"),
        QStringLiteral("ss"),
        QStringLiteral("\u017F"), // long s
        QStringLiteral("ho\u017Ft"),
        QStringLiteral("s\u017F"),
        QStringLiteral("\u212A"), // Kelvin sign
        QStringLiteral("k\u212A"),
        QStringLiteral("\u0130"), // Turkish i's
        QStringLiteral("\u0131"),
        QStringLiteral("i"),
        QStringLiteral("I"),
        QStringLiteral("\u00E4"),
        QStringLiteral("\u00C4"),
        QStringLiteral("\u0416"),
        QStringLiteral("\U00010400"),
        QStringLiteral("\U00010428"),
        QStringLiteral("\uFF11"), // a wide digit
        QStringLiteral("@"),
        QStringLiteral("`"),
        QStringLiteral("_"),
        QStringLiteral("\u0000"),
        QStringLiteral("xxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxx"),
        QStringLiteral("                                        "),
    };
    QStringList texts{hard};
    while (texts.size() < count) {
        const int row{random.bounded(table.rowCount())};
        const QString cell{table.index(row, random.bounded(table.columnCount())).data().toString()};
        const QString::size_type begin{random.bounded(cell.size() + 1)};
        QString text{cell.mid(begin, random.bounded(1, 12))};
        switch (random.bounded(6)) {
        case 0:
            text = text.toUpper();
            break;
        case 1:
            text = text.toLower();
            break;
        case 2:
            text += QLatin1Char{'.'};
            break;
        default:
            break;
        }
        texts.append(text);
    }
    return texts;
}
