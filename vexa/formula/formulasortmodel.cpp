#include <vexa/formula/formulasortmodel.h>

#include <vexa/formula/formulatablemodel.h>
#include <vexa/formula/recipewidgetsettings.h>

#include <domain/colorant.h>

#include <QLocale>

#include <cmath>

namespace vexa {

FormulaSortModel::FormulaSortModel(QObject *parent)
    : QSortFilterProxyModel(parent)
{
    setSortRole(Qt::UserRole);
    setSortLocaleAware(true);
}

QVariant FormulaSortModel::data(const QModelIndex &index, int role) const
{
    const auto *formulaModel = qobject_cast<const FormulaTableModel *>(sourceModel());
    if (!formulaModel || !index.isValid()
        || formulaModel->columnKind(index.column()) != FormulaTableModel::ColumnKind::Accumulated
        || (role != Qt::DisplayRole && role != Qt::ToolTipRole && role != Qt::UserRole))
        return QSortFilterProxyModel::data(index, role);
    double sum = 0.0;
    for (int r = 0; r <= index.row(); ++r)
        sum += formulaModel->valueAt(mapToSource(this->index(r, index.column())).row(),
                                     FormulaTableModel::ColumnKind::Amount);
    if (!std::isfinite(sum))
        return QVariant();
    if (role == Qt::UserRole)
        return sum;
    return QLocale().toString(sum, 'f', formulaModel->settings()->colorantAmountDecimalPoints());
}

bool FormulaSortModel::lessThan(const QModelIndex &left, const QModelIndex &right) const
{
    const QAbstractItemModel *model = sourceModel();
    const QString leftType = model->index(left.row(), 0).data(Qt::UserRole).toString();
    const QString rightType = model->index(right.row(), 0).data(Qt::UserRole).toString();
    const QString clear = QLatin1String(ColorantType::Clear);
    if (!leftType.isEmpty() && !rightType.isEmpty() && (leftType == clear || rightType == clear)) {
        // The view reverses the comparison for a descending sort; Clear rows stay last in
        // both orders, and two Clear rows compare equal (they keep their order).
        const bool clearLast = leftType != clear && rightType == clear;
        const bool clearFirst = leftType == clear && rightType != clear;
        return sortOrder() == Qt::AscendingOrder ? clearLast : clearFirst;
    }
    return QSortFilterProxyModel::lessThan(left, right);
}

} // namespace vexa
