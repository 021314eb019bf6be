#include <vexa/formula/formulatable.h>

#include <QApplication>
#include <QClipboard>
#include <QHeaderView>
#include <QKeyEvent>

namespace vexa {

FormulaTable::FormulaTable(QWidget *parent)
    : QTableView(parent)
{
    setObjectName(QStringLiteral("formulaTable"));
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setWordWrap(false);
    setShowGrid(false);
    setAlternatingRowColors(true);
    verticalHeader()->hide();
    horizontalHeader()->setHighlightSections(false);
}

QString FormulaTable::clipboardText() const
{
    QString text;
    const QAbstractItemModel *source = model();
    if (!source)
        return text;
    for (int r = 0; r < source->rowCount(); ++r) {
        for (int c = 0; c < source->columnCount(); ++c) {
            if (c > 0)
                text += QLatin1Char('\t');
            text += source->index(r, c).data(Qt::DisplayRole).toString();
        }
        text += QLatin1Char('\n');
    }
    return text;
}

void FormulaTable::copyDataToClipboard()
{
    if (QClipboard *clipboard = QApplication::clipboard())
        clipboard->setText(clipboardText());
}

void FormulaTable::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_C && event->modifiers() == Qt::ControlModifier) {
        copyDataToClipboard();
        event->accept();
        return;
    }
    QTableView::keyPressEvent(event);
}

} // namespace vexa
