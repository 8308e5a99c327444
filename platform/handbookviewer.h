// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QWidget>

class QLabel;
class QLineEdit;
class QListWidget;
class QTextBrowser;
class QUrl;

/// The bundled handbook in the user's language, or else in English: a table of contents, the page chosen in it, the way
/// back from the links that were followed, and a search through all pages.
class HandbookViewer final : public QWidget
{
    Q_OBJECT

public:
    explicit HandbookViewer(QWidget *parent = nullptr);
    Q_DISABLE_COPY_MOVE(HandbookViewer)

protected:
    void keyPressEvent(QKeyEvent *event) override;

private:
    void listPages();
    void layOut();
    void showPage(int row);
    void settlePage(const QUrl &page);
    void findNext();

    QListWidget *m_contents;
    QTextBrowser *m_page;
    QLineEdit *m_search;
    QLabel *m_notFound;
};
