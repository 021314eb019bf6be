#pragma once

#include <vexa/vexa_export.h>

#include <QSortFilterProxyModel>

namespace vexa {

// Sorts a formula table by the clicked column (its Qt::UserRole values: raw numbers, names)
// and keeps the Clear colorants (binders, clear coats) below the others in either order.
// The colorant type is read from the UserRole of column 0, the formula table's icon column.
//
// Over a FormulaTableModel the running totals ("Accumulated") add up the amounts in the
// order shown, so that they stay the scale readings while colorants are weighed in.
class VEXA_EXPORT FormulaSortModel : public QSortFilterProxyModel
{
    Q_OBJECT
public:
    explicit FormulaSortModel(QObject *parent = nullptr);

    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;

protected:
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override;
};

} // namespace vexa
