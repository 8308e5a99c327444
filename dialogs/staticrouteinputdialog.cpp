// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/staticrouteinputdialog.h"

#include "dialogs/buttons.h"
#include "dialogs/netmask.h"
#include "dialogs/patterns.h"
#include "dialogs/routemodel.h"
#include "dialogs/spokenfocus.h"
#include "ui_staticrouteinputdialog.h"

#include <QHostAddress>
#include <QMessageBox>
#include <QRegularExpression>
#include <QScrollBar>
#include <QStyledItemDelegate>

#include <algorithm>

namespace {

/// A word of the option value as the table shows it. Every plain number but 0 is deliberately read as a prefix length,
/// even a network of one octet.
QString shownWord(const QString &word)
{
    if (const int prefixLength{word.toInt()}; prefixLength != 0)
        return netmaskText(QHostAddress{QHostAddress::AnyIPv4}, prefixLength);
    return QString{word}.replace(QLatin1Char{','}, QLatin1Char{'.'});
}

/// The text of a cell as a word of the option value. Every net mask is deliberately written as its prefix length, even
/// a network that looks like one (192.0.0.0).
QString optionWord(const QString &cell)
{
    if (QString{cell}.remove(patterns::netmask()).isEmpty())
        return QString::number(prefixLength(cell));
    return QString{cell}.replace(QLatin1Char{'.'}, QLatin1Char{','});
}

/// Lets a screen reader say which column is being edited.
class RouteDelegate final : public QStyledItemDelegate
{
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    QWidget *createEditor(QWidget *parent, const QStyleOptionViewItem &option, const QModelIndex &index) const override
    {
        QWidget *editor{QStyledItemDelegate::createEditor(parent, option, index)};
        editor->setAccessibleName(index.model()->headerData(index.column(), Qt::Horizontal).toString());
        return editor;
    }
};

/// Makes room for a whole address, also while it is edited, and for the title in every column, beside row numbers of up
/// to three digits.
void widenColumns(QTableView *table)
{
    const QFontMetrics metrics{table->fontMetrics()};
    QHeaderView *header{table->horizontalHeader()};
    int width{metrics.horizontalAdvance(QStringLiteral("  255.255.255.255  "))};
    for (int column{0}; column < header->count(); ++column)
        width = std::max(width, header->sectionSizeHint(column));
    header->setMinimumSectionSize(width);
    const int rowNumbers{table->verticalHeader()->sizeHint().width() +
                         metrics.horizontalAdvance(QStringLiteral("999"))};
    table->setMinimumWidth(rowNumbers + header->count() * width + table->verticalScrollBar()->sizeHint().width() +
                           2 * table->frameWidth());
}

} // namespace

StaticRouteInputDialog::StaticRouteInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::StaticRouteInputDialog>()}
    , m_model{new RouteModel{this}}
{
    m_ui->setupUi(this);
    m_ui->StaticRouteTable->setModel(m_model);
    m_ui->StaticRouteTable->setItemDelegate(new RouteDelegate{m_ui->StaticRouteTable});
    m_ui->StaticRouteTable->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    widenColumns(m_ui->StaticRouteTable);
    m_ui->addButton->setIcon(QIcon::fromTheme(QStringLiteral("list-add")));
    m_ui->removeButton->setIcon(QIcon::fromTheme(QStringLiteral("list-remove")));
    connect(m_ui->addButton, &QPushButton::clicked, this, &StaticRouteInputDialog::handleAddStaticRoute);
    connect(m_ui->removeButton, &QPushButton::clicked, this, &StaticRouteInputDialog::handleRemoveStaticRoute);
    new SpokenFocus{m_ui->StaticRouteTable};
    for (QPushButton *button : {m_ui->addButton, m_ui->removeButton})
        buttons::pressByReturn(button);
    connect(m_ui->StaticRouteTable, &QTableView::clicked, this, [this] { m_ui->removeButton->setEnabled(true); });
    // A row is selected by keys, too.
    connect(m_ui->StaticRouteTable->selectionModel(), &QItemSelectionModel::selectionChanged, this,
            [this](const QItemSelection &selected) {
                if (!selected.isEmpty())
                    m_ui->removeButton->setEnabled(true);
            });
}

StaticRouteInputDialog::~StaticRouteInputDialog() = default;

void StaticRouteInputDialog::setRoutes(const QString &text, bool ms)
{
    if (ms)
        m_ui->checkBoxMS->setChecked(true);
    QStringList words{text.split(QLatin1String{", "})};
    std::transform(words.cbegin(), words.cend(), words.begin(), shownWord);
    m_model->addRoutes(words);
}

QStringList StaticRouteInputDialog::routes() const
{
    QStringList words{cellTexts()};
    std::transform(words.cbegin(), words.cend(), words.begin(), optionWord);
    return words;
}

bool StaticRouteInputDialog::isMsRoute() const { return m_ui->checkBoxMS->isChecked(); }

void StaticRouteInputDialog::lockMsRoute() { m_ui->checkBoxMS->setEnabled(false); }

void StaticRouteInputDialog::handleAddStaticRoute()
{
    m_model->addRoutes({QString{}, QString{}, QString{}});
    QTableView *table{m_ui->StaticRouteTable};
    table->scrollToBottom();
    // The keyboard goes on there. What is selected stays, since that is what a removal is about.
    if (!table->selectionModel()->hasSelection()) {
        table->selectionModel()->setCurrentIndex(m_model->index(m_model->rowCount() - 1, 0),
                                                 QItemSelectionModel::NoUpdate);
    }
}

void StaticRouteInputDialog::accept()
{
    if (cellTexts().contains(QString{})) {
        QMessageBox::information(this, tr("Information"), tr("There is an empty cell.\nTo add, fill in the cell."));
        return;
    }
    QDialog::accept();
}

void StaticRouteInputDialog::handleRemoveStaticRoute()
{
    m_model->removeRoute(m_ui->StaticRouteTable->currentIndex());
    if (!m_ui->StaticRouteTable->selectionModel()->hasSelection())
        buttons::disable(m_ui->removeButton, m_ui->StaticRouteTable);
}

QStringList StaticRouteInputDialog::cellTexts() const
{
    QStringList texts;
    for (int row{0}; row < m_model->rowCount(); ++row) {
        for (int column{0}; column < m_model->columnCount(); ++column)
            texts.append(m_model->index(row, column).data().toString());
    }
    return texts;
}
