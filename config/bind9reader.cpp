// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/bind9reader.h"

#include "common/fileio.h"
#include "common/textencoding.h"
#include "config/values.h"

#include <QDir>
#include <QFileInfo>
#include <QHash>
#include <QRegularExpression>
#include <QSet>
#include <QVector>

#include <algorithm>
#include <utility>

namespace {

// Of included files: how deep they may include each other, and how many bytes they may be together.
constexpr int maximumIncludeDepth{16};
constexpr int maximumTotalSize{16 * 1024 * 1024};

constexpr QLatin1Char quote{'"'};
constexpr QLatin1Char dot{'.'};

const QLatin1String zoneKeyword{"zone"};
const QLatin1String keyKeyword{"key"};
const QLatin1String primaryKeyword{"primary"};
const QLatin1String algorithmKeyword{"algorithm"};
const QLatin1String secretKeyword{"secret"};

constexpr int wordsOfGroup{6};
constexpr int wordsOfHeading{4}; // of a zone, with the address of the name server

bool isBlank(QChar c) { return c == QLatin1Char{' '} || c == QLatin1Char{'\t'} || c == QLatin1Char{'\n'}; }

bool isDelimiter(QChar c) { return c == QLatin1Char{';'} || c == QLatin1Char{'{'} || c == QLatin1Char{'}'}; }

int endOfLine(const QString &text, int position)
{
    const int end{text.indexOf(QLatin1Char{'\n'}, position)};
    return end < 0 ? text.size() : end;
}

// Where the comment that starts at `position` ends; `position` when none does.
int endOfComment(const QString &text, int position)
{
    const auto rest = QStringView{text}.mid(position);
    if (rest.startsWith(QLatin1String{"//"}) || rest.startsWith(QLatin1Char{'#'}))
        return endOfLine(text, position);
    if (!rest.startsWith(QLatin1String{"/*"}))
        return position;
    const int end{text.indexOf(QLatin1String{"*/"}, position + 2)};
    return end < 0 ? text.size() : end + 2;
}

// The text of a file, without comments and with the text of other files in the place of the statements that include
// them. `includedBy` are the files that led here.
QString textWithIncludes(const QString &path, QStringList includedBy, int &sizeLeft)
{
    static const QRegularExpression include{QStringLiteral(R"re(\binclude\s+"([^"]*)"\s*;)re"),
                                            QRegularExpression::CaseInsensitiveOption};
    const QFileInfo file{path};
    const QString canonicalPath{file.canonicalFilePath()};
    if (includedBy.contains(canonicalPath) || includedBy.size() >= maximumIncludeDepth)
        return {};
    const auto bytes = fileio::readFile(path);
    if (!bytes || bytes->size() > sizeLeft)
        return {};
    sizeLeft -= bytes->size();
    includedBy += canonicalPath;

    const QString text{bind9::withoutComments(TextEncoding::detect(*bytes).decode(*bytes))};
    QString result;
    int position{};
    for (auto it = include.globalMatch(text); it.hasNext();) {
        const auto match = it.next();
        result += text.midRef(position, match.capturedStart() - position);
        result += textWithIncludes(file.dir().absoluteFilePath(match.captured(1)), includedBy, sizeLeft);
        position = match.capturedEnd();
    }
    return result + text.midRef(position);
}

// Goes through a text statement by statement. Blanks and delimiters between quotes are part of a word.
class Words final
{
public:
    explicit Words(const QString &text)
        : m_text{text}
    {
    }

    /// Reads the words up to the next delimiter; false when there is none.
    bool next();
    const QStringList &words() const { return m_words; }
    QChar delimiter() const { return m_text.at(m_position - 1); }

private:
    const QString &m_text;
    int m_position{};
    QStringList m_words;
};

bool Words::next()
{
    m_words.clear();
    QString word;
    bool quoted{};
    while (m_position < m_text.size()) {
        const QChar c{m_text.at(m_position++)};
        if (c == quote)
            quoted = !quoted;
        if (quoted || !(c.isSpace() || isDelimiter(c))) {
            word += c;
            continue;
        }
        if (!word.isEmpty())
            m_words += std::exchange(word, {});
        if (isDelimiter(c))
            return true;
    }
    return false;
}

enum class Block
{
    Outermost, // also a view, which holds the same
    Zone,
    Updaters, // who may update a zone
    Key,
    Other
};

bool hasHeading(Block block) { return block == Block::Zone || block == Block::Key; }

QString lowerKeyword(const QStringList &words) { return words.value(0).toLower(); }

Block blockWithin(Block outer, const QStringList &words)
{
    const QString keyword{lowerKeyword(words)};
    if (outer == Block::Outermost) {
        if (keyword == QLatin1String{"view"})
            return Block::Outermost;
        if (keyword == zoneKeyword)
            return Block::Zone;
        if (keyword == keyKeyword)
            return Block::Key;
    }
    const bool isForUpdaters{keyword == QLatin1String{"allow-update"} || keyword == QLatin1String{"update-policy"}};
    return outer == Block::Zone && isForUpdaters ? Block::Updaters : Block::Other;
}

// What a statement of `block` is worth in a text of zones and keys: a keyword and a word, or nothing.
QStringList keptWords(Block block, const QStringList &words)
{
    const QString keyword{lowerKeyword(words)};
    const QString value{words.value(1)};
    if (block == Block::Updaters && (keyword == keyKeyword || keyword == QLatin1String{"grant"}))
        return {keyKeyword, value};
    if (block == Block::Key && (keyword == algorithmKeyword || keyword == secretKeyword))
        return {keyword, value};
    return {};
}

QStringList keptHeading(Block block, const QStringList &words)
{
    if (block == Block::Key)
        return {keyKeyword, words.value(1)};
    QString name{values::unquoted(words.value(1))};
    if (name.endsWith(dot))
        name.chop(1); // statements() appends one
    return {zoneKeyword, name};
}

bool dropsStatement(const QString &word)
{
    static const QStringList words{QStringLiteral("type"), QStringLiteral("file"), QStringLiteral("allow-update")};
    return words.contains(word);
}

// Whether statements() would misread a value that stands without quotes: some words mean the same to it wherever they
// stand, and a slash starts a comment.
bool needsQuotes(const QString &value)
{
    return dropsStatement(value) || value == zoneKeyword ||
           (value.contains(QLatin1Char{'/'}) && !value.contains(quote));
}

// Appends a statement of two words; false when there is none, or when statements() would not keep it together.
bool appendStatement(QString &text, const QStringList &words, QChar delimiter)
{
    QString value{words.value(1)};
    const bool isWhole{
        std::none_of(value.cbegin(), value.cend(), [](QChar c) { return isBlank(c) || isDelimiter(c); })};
    if (value.isEmpty() || !isWhole)
        return false;
    if (needsQuotes(value))
        value = quote + value + quote;
    text += words.first() + QLatin1Char{' '} + value + delimiter + QLatin1Char{'\n'};
    return true;
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
    const int algorithm{words.indexOf(algorithmKeyword, 2) + 1};
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

} // namespace

namespace bind9 {

QStringList prepared(const QString &path, const QStringList &knownKeys) { return usable(readFile(path), knownKeys); }

QStringList readFile(const QString &path)
{
    int sizeLeft{maximumTotalSize};
    return statements(zonesAndKeys(textWithIncludes(path, {}, sizeLeft)));
}

QString withoutComments(const QString &text)
{
    QString result;
    result.reserve(text.size());
    bool quoted{};
    for (int i{}; i < text.size();) {
        if (const int end{quoted ? i : endOfComment(text, i)}; end > i) {
            result += QLatin1Char{' '};
            i = end;
            continue;
        }
        const QChar c{text.at(i++)};
        if (c == quote)
            quoted = !quoted;
        result += c;
    }
    return result;
}

QString zonesAndKeys(const QString &text)
{
    QString result;
    QVector<Block> blocks{Block::Outermost};
    for (Words statement{text}; statement.next();) {
        const QChar delimiter{statement.delimiter()};
        const Block block{blocks.last()};
        if (delimiter == QLatin1Char{';'}) {
            appendStatement(result, keptWords(block, statement.words()), delimiter);
        } else if (delimiter == QLatin1Char{'{'}) {
            const Block inner{blockWithin(block, statement.words())};
            const bool isKept{!hasHeading(inner) ||
                              appendStatement(result, keptHeading(inner, statement.words()), delimiter)};
            blocks += isKept ? inner : Block::Other;
        } else if (blocks.size() > 1) {
            if (hasHeading(block))
                result += QLatin1String{"};\n"};
            blocks.removeLast();
        }
    }
    return result;
}

QStringList statements(const QString &text)
{
    QStringList result;
    QStringList words;
    QString word;
    bool quoted{};
    for (int i{}; i < text.size(); ++i) {
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
