// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/leases/referencereader.h"

#include "leases/leaseparser.h"
#include "leases/leasetable.h"
#include "leases/leasetimetexts.h"
#include "tests/leases/longtime.h"

#include <QAbstractItemModel>
#include <QDateTime>
#include <QHostAddress>
#include <QLocale>
#include <QMap>

#include <utility>

namespace {

/// A text in which each character is a byte; the reference works on such. A NUL does not end it.
QString bytesAsText(const QByteArray &bytes) { return QString::fromLatin1(bytes.constData(), bytes.size()); }

QString shown(const QString &bytes)
{
    const QByteArray raw{bytes.toLatin1()};
    // Behind another character, a byte order mark is text.
    const QByteArray marked{'x' + raw};
    const QString decoded{QString::fromUtf8(marked.constData(), marked.size())};
    return decoded.toUtf8() == marked ? decoded.mid(1) : bytes;
}

QString withoutEnds(const QString &bytes, int first, int last)
{
    const QString text{shown(bytes)};
    const QString rest{text.mid(first).chopped(qMin(last, qMax(0, text.size() - first)))};
    return text == bytes ? rest : bytesAsText(rest.toUtf8());
}

/// A line with every quoted character and every character of a comment made a character that means nothing, and the
/// place of the first quote of each quoted text with the place of its last one (or -1).
struct Scanned
{
    QString outside;
    QMap<QString::size_type, QString::size_type> quotes;
};

Scanned scan(const QString &line)
{
    enum
    {
        Outside,
        Quoted,
        Escaped,
        Comment
    } state{Outside};
    Scanned scanned{line, {}};
    QString::size_type opening{-1};
    for (QString::size_type i{0}; i < line.size(); ++i) {
        const QChar c{line[i]};
        switch (state) {
        case Outside:
            if (c == QLatin1Char{'"'}) {
                state = Quoted;
                opening = i;
                scanned.quotes[opening] = -1;
            } else if (c == QLatin1Char{'#'}) {
                state = Comment;
            }
            break;
        case Quoted:
            if (c == QLatin1Char{'\\'}) {
                state = Escaped;
            } else if (c == QLatin1Char{'"'}) {
                state = Outside;
                scanned.quotes[opening] = i;
            }
            scanned.outside[i] = QLatin1Char{'?'};
            break;
        case Escaped:
            state = Quoted;
            scanned.outside[i] = QLatin1Char{'?'};
            break;
        case Comment:
            scanned.outside[i] = QLatin1Char{'?'};
            break;
        }
    }
    return scanned;
}

QString timeText(const QString &date, const QString &time)
{
    const QDateTime parsed{QDateTime::fromString(shown(date) + QLatin1Char{' '} + shown(withoutEnds(time, 0, 1)),
                                                 QStringLiteral("yyyy/MM/dd hh:mm:ss"))};
    return parsed.isValid() ? longTime(QLocale{}, parsed.time()) + QLatin1Char{' '} +
                                  QLocale{}.toString(parsed.date(), QLocale::NarrowFormat)
                            : QString{};
}

} // namespace

LeaseRows referenceRows(const QByteArray &text)
{
    QMap<quint32, QStringList> rows;
    QHostAddress address;
    QString mac;
    QString host;
    QString state;
    QString start;
    QString end;
    const QStringList lines{bytesAsText(text).remove(QLatin1Char{'\r'}).split(QLatin1Char{'\n'})};
    for (const QString &line : lines) {
        const QStringList words{line.split(QLatin1Char{' '})};
        const Scanned scanned{scan(line)};
        const auto has = [&](const char *part) { return scanned.outside.contains(QLatin1String{part}); };
        if (has("{")) {
            address = QHostAddress{shown(words.value(1))};
        } else if (has("hardware")) {
            mac = withoutEnds(words.value(4), 0, 1);
        } else if (has("client-hostname")) {
            const QString::size_type place{words.size() > 3 ? words.mid(0, 3).join(QLatin1Char{' '}).size() + 1 : -1};
            const QString::size_type closing{scanned.quotes.value(place, -1)};
            host = closing >= 0 ? line.mid(place + 1, closing - place - 1) : withoutEnds(words.value(3), 1, 2);
        } else if (has("binding state") && !has("next") && !has("rewind")) {
            state = withoutEnds(words.value(4), 0, 1);
        } else if (has("starts")) {
            start = timeText(words.value(4), words.value(5));
        } else if (has("ends")) {
            end = timeText(words.value(4), words.value(5));
        } else if (has("}")) {
            rows[address.toIPv4Address()] =
                QStringList{address.toString(), shown(mac), shown(host), shown(state), start, end};
        }
    }
    return rows.values().toVector();
}

LeaseRows rowsOf(const LeaseTable &table)
{
    LeaseRows rows;
    LeaseTimeTexts times;
    for (int row{0}; row < table.size(); ++row) {
        const Lease &lease{table.at(row)};
        const auto text = [&](LeaseColumn column, LeaseTexts::Id id) {
            return decodeLeaseText(table.texts(column).at(id));
        };
        rows.append(QStringList{table.addressText(lease.address), text(LeaseColumn::Mac, lease.mac),
                                text(LeaseColumn::HostName, lease.host), text(LeaseColumn::State, lease.state),
                                times.text(lease.start), times.text(lease.end)});
    }
    return rows;
}

LeaseRows rowsOf(const QAbstractItemModel &model)
{
    LeaseRows rows;
    for (int row{0}; row < model.rowCount(); ++row) {
        QStringList texts;
        for (int column{0}; column < model.columnCount(); ++column)
            texts.append(model.data(model.index(row, column)).toString());
        rows.append(texts);
    }
    return rows;
}

LeaseRows parsedRows(const QByteArray &text, const QVector<int> &places)
{
    LeaseTable table;
    LeaseParser parser{table};
    QVector<int> ends{places};
    ends.append(static_cast<int>(text.size()));
    int begin{0};
    for (const int end : qAsConst(ends)) {
        parser.feed({text.constData() + begin, static_cast<std::size_t>(end - begin)});
        begin = end;
    }
    parser.finish();
    table.settleAll();
    return rowsOf(table);
}
