// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/handbookviewer.h"

#include <QDir>
#include <QFile>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QLocale>
#include <QPushButton>
#include <QScrollBar>
#include <QShortcut>
#include <QSplitter>
#include <QTextBlock>
#include <QTextBrowser>
#include <QUrl>

#include <memory>

namespace {

constexpr int contentsWidth{200};
constexpr int contentsSpacing{2};
constexpr int pageWidth{880};
constexpr int pageMargin{12};
constexpr int codeMargin{16};

// The user's languages in his order, as the translations of the program are looked for.
QString handbookFolder()
{
    const QStringList languages{QLocale{}.uiLanguages()};
    for (const QString &language : languages) {
        QString folder{QStringLiteral(":/handbook/") + language.section(QLatin1Char{'-'}, 0, 0)};
        if (QFile::exists(folder))
            return folder;
    }
    return QStringLiteral(":/handbook/en");
}

std::unique_ptr<QTextDocument> documentOf(const QUrl &page)
{
    auto document = std::make_unique<QTextDocument>();
    QFile file{QLatin1Char{':'} + page.path()};
    if (file.open(QIODevice::ReadOnly))
        document->setMarkdown(QString::fromUtf8(file.readAll()));
    return document;
}

QUrl urlOf(const QListWidgetItem *item) { return item->data(Qt::UserRole).toUrl(); }

// Qt tells code from other text by its font alone.
void setOffCode(QTextDocument *document, const QBrush &background)
{
    for (QTextBlock block{document->begin()}; block.isValid(); block = block.next()) {
        QTextBlockFormat format{block.blockFormat()};
        if (!format.hasProperty(QTextFormat::BlockCodeFence) && !format.hasProperty(QTextFormat::BlockCodeLanguage))
            continue;
        format.setBackground(background);
        format.setLeftMargin(codeMargin);
        QTextCursor{block}.setBlockFormat(format);
    }
}

} // namespace

HandbookViewer::HandbookViewer(QWidget *parent)
    : QWidget{parent}
    , m_contents{new QListWidget}
    , m_page{new QTextBrowser}
    , m_search{new QLineEdit}
    , m_notFound{new QLabel{tr("Not found")}}
{
    m_contents->setAccessibleName(tr("Contents"));
    m_contents->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_contents->setSpacing(contentsSpacing);
    m_contents->setWordWrap(true);
    m_page->document()->setDocumentMargin(pageMargin);
    m_search->setAccessibleName(tr("Search"));
    m_search->setPlaceholderText(m_search->accessibleName());
    m_notFound->hide();
    layOut();

    connect(m_page, &QTextBrowser::sourceChanged, this, &HandbookViewer::settlePage);
    // With some fonts a slanted word at the end of a line reaches into the margin: nothing to scroll for.
    const auto *bar = m_page->horizontalScrollBar();
    connect(bar, &QScrollBar::rangeChanged, m_page, [this](int, int maximum) {
        m_page->setHorizontalScrollBarPolicy(maximum <= pageMargin ? Qt::ScrollBarAlwaysOff : Qt::ScrollBarAsNeeded);
    });
    connect(m_contents, &QListWidget::currentRowChanged, this, &HandbookViewer::showPage);
    connect(m_search, &QLineEdit::returnPressed, this, &HandbookViewer::findNext);
    connect(m_search, &QLineEdit::textChanged, m_notFound, &QWidget::hide);
    const auto *find = new QShortcut{QKeySequence::Find, this};
    connect(find, &QShortcut::activated, m_search, [this] { m_search->setFocus(Qt::ShortcutFocusReason); });
    listPages();
    setFocusProxy(m_contents);
}

// Return in the search, or on a page of the contents, is not for the default button of the window.
void HandbookViewer::keyPressEvent(QKeyEvent *event)
{
    if (event->key() != Qt::Key_Return && event->key() != Qt::Key_Enter)
        QWidget::keyPressEvent(event);
}

void HandbookViewer::layOut()
{
    auto *back = new QPushButton{QIcon::fromTheme(QStringLiteral("previous")), tr("Back")};
    back->setAutoDefault(false);
    back->setShortcut(QKeySequence::Back);
    back->setEnabled(false);
    connect(back, &QPushButton::clicked, m_page, &QTextBrowser::backward);
    connect(m_page, &QTextBrowser::backwardAvailable, back, &QWidget::setEnabled);

    auto *commands = new QHBoxLayout;
    commands->addWidget(back);
    commands->addWidget(m_search);
    commands->addWidget(m_notFound);
    auto *splitter = new QSplitter;
    splitter->addWidget(m_contents);
    splitter->addWidget(m_page);
    splitter->setSizes({contentsWidth, pageWidth});
    splitter->setStretchFactor(1, 1);
    splitter->setChildrenCollapsible(false);
    auto *layout = new QVBoxLayout{this};
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addLayout(commands);
    layout->addWidget(splitter);
}

// Each page begins with its title, and the names of the files sort as the pages follow each other.
void HandbookViewer::listPages()
{
    const QDir folder{handbookFolder()};
    const QStringList names{folder.entryList({QStringLiteral("*.md")}, QDir::Files, QDir::Name)};
    for (const QString &name : names) {
        const QUrl page{QStringLiteral("qrc") + folder.filePath(name)};
        auto *item = new QListWidgetItem{documentOf(page)->begin().text(), m_contents};
        item->setData(Qt::UserRole, page);
    }
    m_contents->setCurrentRow(0);
}

void HandbookViewer::showPage(int row)
{
    const QUrl page{urlOf(m_contents->item(row))};
    if (m_page->source() != page)
        m_page->setSource(page);
}

void HandbookViewer::settlePage(const QUrl &page)
{
    setOffCode(m_page->document(), palette().alternateBase());
    for (int row{0}; row < m_contents->count(); ++row) {
        if (urlOf(m_contents->item(row)) == page)
            m_contents->setCurrentRow(row);
    }
    m_page->setAccessibleName(m_contents->currentItem()->text());
}

// From the last find on, through the pages that follow, round to the beginning of this one.
void HandbookViewer::findNext()
{
    const QString text{m_search->text()};
    bool isFound{text.isEmpty() || m_page->find(text)};
    const int current{m_contents->currentRow()};
    for (int i{1}; i <= m_contents->count() && !isFound; ++i) {
        const int row{(current + i) % m_contents->count()};
        if (documentOf(urlOf(m_contents->item(row)))->find(text).isNull())
            continue;
        m_contents->setCurrentRow(row);
        m_page->moveCursor(QTextCursor::Start);
        isFound = m_page->find(text);
    }
    m_notFound->setVisible(!isFound);
}
