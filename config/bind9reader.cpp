// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/bind9reader.h"

#include "common/fileio.h"
#include "common/textencoding.h"
#include "config/bind9contents.h"
#include "config/bind9words.h"
#include "config/values.h"

#include <QDir>
#include <QFileInfo>
#include <QHash>
#include <QRegularExpression>
#include <QSet>

#include <algorithm>
#include <iterator>
#include <utility>

using bind9::isDelimiter;
using bind9::Key;
using bind9::LeftOutZone;
using bind9::quote;
using bind9::Zone;

namespace {

// Of a file and those that it includes: how deep they may include each other, and how many files and bytes are read.
constexpr int maximumIncludeDepth{16};
constexpr int maximumFiles{1000};
constexpr int maximumTotalSize{16 * 1024 * 1024};

// What the DHCP server can read as one word.
constexpr int longestWord{1499};

constexpr QLatin1Char dot{'.'};

const QLatin1String zoneKeyword{"zone"};
const QLatin1String keyKeyword{"key"};
const QLatin1String primaryKeyword{"primary"};
const QLatin1String algorithmKeyword{"algorithm"};
const QLatin1String secretKeyword{"secret"};

constexpr int wordsOfGroup{6};
constexpr int wordsOfHeading{4}; // of a zone, with the address of the name server

bool isBlank(QChar c) { return c == QLatin1Char{' '} || c == QLatin1Char{'\t'} || c == QLatin1Char{'\n'}; }

/// Reads a file and those that it includes.
class FileReader final
{
public:
    /// The text of a file, without comments and with the text of other files in the place of the statements that
    /// include them; empty when it cannot be read, or when that would be too much.
    QString read(const QString &path);

private:
    QStringList m_openFiles;
    int m_filesLeft{maximumFiles};
    QByteArray::size_type m_sizeLeft{maximumTotalSize};
};

QString FileReader::read(const QString &path)
{
    const QFileInfo file{path};
    const QString canonicalPath{file.canonicalFilePath()};
    if (m_openFiles.contains(canonicalPath) || m_openFiles.size() >= maximumIncludeDepth || m_filesLeft == 0)
        return {};
    --m_filesLeft;
    const std::optional<QByteArray> bytes{fileio::readFile(path)};
    if (!bytes || bytes->size() > m_sizeLeft)
        return {};
    m_sizeLeft -= bytes->size();

    m_openFiles += canonicalPath;
    const QString text{bind9::withoutComments(TextEncoding::detect(*bytes).decode(*bytes))};
    QString result;
    QString::size_type position{};
    for (bind9::Words statement{text}; statement.next();) {
        const QStringList &words{statement.words()};
        const bool isInclude{words.size() == 2 && statement.delimiter() == QLatin1Char{';'} &&
                             words.first().toLower() == QLatin1String{"include"} && words.last().startsWith(quote)};
        if (!isInclude)
            continue;
        result.append(text.constData() + position, statement.begin() - position);
        result += read(file.dir().absoluteFilePath(bind9::unescaped(words.last())));
        position = statement.end();
    }
    m_openFiles.removeLast();
    return result + text.mid(position);
}

QString::size_type endOfLine(const QString &text, QString::size_type position)
{
    const QString::size_type end{text.indexOf(QLatin1Char{'\n'}, position)};
    return end < 0 ? text.size() : end;
}

bool dropsStatement(const QString &word)
{
    static const QStringList words{QStringLiteral("type"), QStringLiteral("file"), QStringLiteral("allow-update")};
    return words.contains(word);
}

// What a statement that ends with `delimiter` adds to the statement list.
QStringList scannedStatement(QStringList words, QChar delimiter)
{
    while (words.size() < 2)
        words += QString{};
    if (std::any_of(words.cbegin(), words.cend(), dropsStatement))
        return delimiter == QLatin1Char{'}'} ? words : QStringList{}; // deliberately not dropped before a closing brace
    if (words.contains(zoneKeyword)) {
        words[1] = values::unquoted(words.at(1)) + dot;
        if (delimiter == QLatin1Char{'{'})
            words << primaryKeyword << QStringLiteral("127.0.0.1");
    }
    return words;
}

// The name of a key in the form in which bind9 compares it.
QString comparableName(const QString &name)
{
    QString comparable{values::unquoted(name).toLower()};
    if (comparable.endsWith(dot))
        comparable.chop(1);
    return comparable;
}

// The DHCP server, other than bind9, takes names with and without a dot at their end for different ones.
QString referenceTo(const QString &definedName, const QString &name)
{
    return values::unquoted(definedName).endsWith(dot) == values::unquoted(name).endsWith(dot) ? name : definedName;
}

QStringList keyWithPlainAlgorithm(QStringList words)
{
    const QStringList::size_type algorithm{words.indexOf(algorithmKeyword, 2) + 1};
    words[algorithm] = values::unquoted(words.at(algorithm));
    return words;
}

bool isKeyAt(const QStringList &statements, int position)
{
    if (statements.value(position) != keyKeyword)
        return false;
    const QStringList words{statements.mid(position, wordsOfGroup)};
    return words.size() == wordsOfGroup && !words.contains(QString{}) &&
           QSet<QString>{words.value(2), words.value(4)} == QSet<QString>{algorithmKeyword, secretKeyword};
}

bool isZoneAt(const QStringList &statements, int position)
{
    return statements.value(position) == zoneKeyword && statements.value(position + 2) == primaryKeyword;
}

// Whether the DHCP server reads `text` as the name of a host or a zone.
bool isHostName(const QString &text)
{
    static const QRegularExpression hostName{QStringLiteral(R"re(\A[A-Za-z0-9-][\w-]*(\.[A-Za-z0-9-][\w-]*)*\.?\z)re")};
    return text.size() <= longestWord && hostName.match(text).hasMatch();
}

// Whether the DHCP server reads `text` as the bytes of a key: what is left of the last one must be padded, or zero.
bool isBase64(const QString &text)
{
    static const QRegularExpression base64{QStringLiteral(
        R"re(\A([A-Za-z0-9+/]{4})*(|[A-Za-z0-9+/][AQgw]=*|[A-Za-z0-9+/]{2}[AEIMQUYcgkosw048]=*|[A-Za-z0-9+/]{2}==|[A-Za-z0-9+/]{3}=)\z)re")};
    return !text.isEmpty() && text.size() <= longestWord && base64.match(text).hasMatch();
}

// Of a word: whether it has no quotes but around the whole, and nothing that its quotes would have to protect from the
// reader of the configuration.
bool isPlainOrQuoted(const QString &word)
{
    const QString text{values::unquoted(word)};
    return !text.isEmpty() && text.toUtf8().size() <= longestWord && (word == text || word == values::quoted(text)) &&
           std::none_of(text.cbegin(), text.cend(), [](QChar c) {
               return isBlank(c) || isDelimiter(c) || c == bind9::escape || c == QLatin1Char{'\0'};
           });
}

bool isUsableSecret(const QString &word) { return isPlainOrQuoted(word) && isBase64(values::unquoted(word)); }

bool isUsableAlgorithm(const QString &word) { return isPlainOrQuoted(word) && isHostName(values::unquoted(word)); }

bool isUsableKey(const Key &key)
{
    QStringList algorithms;
    QStringList secrets;
    for (const auto &[keyword, word] : key.statements)
        (keyword == algorithmKeyword ? algorithms : secrets) += word;
    return isPlainOrQuoted(key.name) && algorithms.size() == 1 && isUsableAlgorithm(algorithms.first()) &&
           secrets.size() == 1 && isUsableSecret(secrets.first());
}

// The name of a key as the DHCP server takes it.
QString acceptedName(const QString &name) { return isHostName(name) ? name : values::quoted(values::unquoted(name)); }

/// Chooses of what was read the keys and zones that the DHCP server accepts.
class Choice final
{
public:
    Choice(bind9::Contents contents, const QStringList &knownKeys, const QStringList &allKeys);

    const bind9::Contents &chosen() const { return m_chosen; }
    const QVector<LeftOutZone> &leftOut() const { return m_leftOut; }

private:
    enum class KeyState
    {
        Usable,
        Behind, // declared in the configuration, but behind the place of adding
        Refused
    };

    void chooseZone(Zone zone);
    void leaveOut(const Zone &zone, LeftOutZone::Reason reason);

    QHash<QString, KeyState> m_keys;
    bind9::Contents m_chosen;
    QVector<LeftOutZone> m_leftOut;
};

Choice::Choice(bind9::Contents contents, const QStringList &knownKeys, const QStringList &allKeys)
{
    for (const auto &entry : contents) {
        const auto *key = std::get_if<Key>(&entry);
        if (!key)
            continue;
        KeyState &state{
            *m_keys.insert(comparableName(key->name), m_keys.value(comparableName(key->name), KeyState::Refused))};
        if (isUsableKey(*key))
            state = KeyState::Usable;
    }
    for (const QString &name : allKeys)
        m_keys.insert(comparableName(name), KeyState::Behind);
    for (const QString &name : knownKeys)
        m_keys.insert(comparableName(name), KeyState::Usable);

    for (auto &entry : contents) {
        if (auto *zone = std::get_if<Zone>(&entry)) {
            chooseZone(std::move(*zone));
            continue;
        }
        Key &key{std::get<Key>(entry)};
        if (isUsableKey(key) && m_keys.value(comparableName(key.name)) == KeyState::Usable) {
            key.name = acceptedName(key.name);
            m_chosen.emplace_back(std::move(key));
        }
    }
}

void Choice::chooseZone(Zone zone)
{
    using Reason = LeftOutZone::Reason;
    if (!zone.isPrimary) {
        leaveOut(zone, Reason::NotPrimary);
        return;
    }
    if (zone.updaters.isEmpty()) {
        leaveOut(zone, Reason::NoUpdateKey);
        return;
    }
    if (!isHostName(zone.name) || zone.name.endsWith(dot)) {
        leaveOut(zone, Reason::RefusedName);
        return;
    }
    const auto updater = std::find_if(zone.updaters.cbegin(), zone.updaters.cend(), [this](const QString &name) {
        return isPlainOrQuoted(name) && m_keys.value(comparableName(name), KeyState::Refused) == KeyState::Usable;
    });
    if (updater != zone.updaters.cend()) {
        zone.updaters = QStringList{acceptedName(*updater)};
        m_chosen.emplace_back(std::move(zone));
        return;
    }
    const auto state = m_keys.constFind(comparableName(zone.updaters.first()));
    if (state == m_keys.cend())
        leaveOut(zone, Reason::UnknownKey);
    else
        leaveOut(zone, *state == KeyState::Behind ? Reason::KeyBehind : Reason::RefusedKey);
}

void Choice::leaveOut(const Zone &zone, LeftOutZone::Reason reason)
{
    m_leftOut.append({zone.name, reason, values::unquoted(zone.updaters.value(0))});
}

} // namespace

namespace bind9 {

Preparation prepared(const QString &path, const QStringList &knownKeys, const QStringList &allKeys)
{
    return preparedText(FileReader{}.read(path), knownKeys, allKeys);
}

Preparation preparedText(const QString &text, const QStringList &knownKeys, const QStringList &allKeys)
{
    const Choice choice{readContents(text), knownKeys, allKeys};
    QStringList acceptedKeys;
    std::transform(knownKeys.cbegin(), knownKeys.cend(), std::back_inserter(acceptedKeys), acceptedName);
    return {usable(bind9::statements(textOf(choice.chosen())), acceptedKeys), choice.leftOut()};
}

QString zonesAndKeys(const QString &text) { return textOf(readContents(text)); }

QStringList statements(const QString &text)
{
    QStringList result;
    QStringList words;
    QString word;
    bool quoted{};
    for (QString::size_type i{}; i < text.size(); ++i) {
        if (!quoted && text.at(i) == QLatin1Char{'/'})
            i = endOfLine(text, i);
        if (i == text.size())
            break;
        const QChar c{text.at(i)};
        if (c == quote)
            quoted = !quoted;
        if (!isBlank(c) && !isDelimiter(c)) {
            word += c;
            continue;
        }
        if (!word.isEmpty())
            words += std::exchange(word, {});
        if (words.size() >= 3 && words.contains(QLatin1String{"IN"}))
            words.removeAt(2); // the class in the heading of a zone
        if (isBlank(c) || words.isEmpty())
            continue;
        result += scannedStatement(std::exchange(words, {}), c);
    }
    return result; // what was not ended by a delimiter is dropped
}

QStringList usable(const QStringList &statements, const QStringList &knownKeys)
{
    QHash<QString, QString> definedNames;
    for (const QString &name : knownKeys)
        definedNames.insert(comparableName(name), name);
    QHash<QString, QStringList> keys; // that are not in the result yet
    for (int i{}; i < statements.size(); ++i) {
        if (!isKeyAt(statements, i))
            continue;
        const QString &name{statements.at(i + 1)};
        definedNames.insert(comparableName(name), name);
        keys.insert(comparableName(name), keyWithPlainAlgorithm(statements.mid(i, wordsOfGroup)));
    }

    QStringList result;
    for (int i{}; i < statements.size();) {
        if (isKeyAt(statements, i)) {
            result += keys.take(comparableName(statements.at(i + 1)));
            i += wordsOfGroup;
        } else if (isZoneAt(statements, i)) {
            const QStringList heading{statements.mid(i, wordsOfHeading)};
            QStringList updaters;
            for (i += wordsOfHeading; statements.value(i) == keyKeyword && !isKeyAt(statements, i); i += 2)
                updaters += statements.value(i + 1);
            const auto updater = std::find_if(updaters.cbegin(), updaters.cend(), [&definedNames](const QString &name) {
                return definedNames.contains(comparableName(name));
            });
            if (updater == updaters.cend())
                continue;
            const QString name{comparableName(*updater)};
            result += keys.take(name) + heading;
            result << keyKeyword << referenceTo(definedNames.value(name), *updater);
        } else {
            ++i;
        }
    }
    return result;
}

} // namespace bind9
