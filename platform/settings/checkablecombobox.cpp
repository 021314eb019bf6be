#include "checkablecombobox_p.h"

#include <QAbstractItemView>
#include <QMouseEvent>
#include <QStandardItemModel>
#include <QStylePainter>

CheckableComboBox::CheckableComboBox(QWidget *parent)
    : QComboBox(parent)
    , m_model(new QStandardItemModel(this))
{
    setModel(m_model);
    view()->viewport()->installEventFilter(this);
    connect(m_model, &QStandardItemModel::itemChanged, this, [this](QStandardItem *item) {
        if (!m_silent)
            Q_EMIT sgItemCheckToggled(item->row(), item->checkState() == Qt::Checked);
    });
}

CheckableComboBox::~CheckableComboBox() = default;

void CheckableComboBox::addCheckableItem(const QString &text, const QString &value, bool checked)
{
    auto *item = new QStandardItem(text);
    item->setData(value, Qt::UserRole);
    item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsUserCheckable);
    item->setCheckState(checked ? Qt::Checked : Qt::Unchecked);
    m_silent = true;
    m_model->appendRow(item);
    m_silent = false;
}

bool CheckableComboBox::isItemChecked(int index) const
{
    const QStandardItem *item = m_model->item(index);
    return item && item->checkState() == Qt::Checked;
}

void CheckableComboBox::setItemChecked(int index, bool checked)
{
    QStandardItem *item = m_model->item(index);
    if (!item)
        return;
    m_silent = true;
    item->setCheckState(checked ? Qt::Checked : Qt::Unchecked);
    m_silent = false;
}

QStringList CheckableComboBox::checkedValues() const
{
    QStringList values;
    for (int row = 0; row < m_model->rowCount(); ++row)
        if (isItemChecked(row))
            values.append(m_model->item(row)->data(Qt::UserRole).toString());
    return values;
}

void CheckableComboBox::setSummaryText(const QString &text)
{
    m_summaryText = text;
    setToolTip(text);
    update();
}

void CheckableComboBox::paintEvent(QPaintEvent *)
{
    QStylePainter painter(this);
    QStyleOptionComboBox option;
    initStyleOption(&option);
    option.currentText = m_summaryText;
    option.currentIcon = QIcon();
    painter.drawComplexControl(QStyle::CC_ComboBox, option);
    painter.drawControl(QStyle::CE_ComboBoxLabel, option);
}

bool CheckableComboBox::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == view()->viewport() && event->type() == QEvent::MouseButtonRelease) {
        const auto *mouseEvent = static_cast<QMouseEvent *>(event);
        const QModelIndex index = view()->indexAt(mouseEvent->pos());
        if (QStandardItem *item = m_model->itemFromIndex(index)) {
            // Toggle and keep the list open for the next choice.
            item->setCheckState(item->checkState() == Qt::Checked ? Qt::Unchecked : Qt::Checked);
            return true;
        }
    }
    return QComboBox::eventFilter(watched, event);
}
