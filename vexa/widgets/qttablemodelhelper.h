#pragma once

#include <vexa/vexa_export.h>

#include <QString>
#include <QVariant>

class QAbstractItemModel;
class QModelIndex;

namespace vexa {

// Number formatting of table cells, shared by the table models: the text shown and
// the number format of the spreadsheet export.
class VEXA_EXPORT QtTableModelHelper
{
public:
    // The raw value of a cell as exported.
    static constexpr int ExportValueRole = Qt::UserRole + 20;
    // The spreadsheet number format of a cell ("0.00").
    static constexpr int ExportNumberFormatRole = Qt::UserRole + 21;

    // The text of the cell's ExportValueRole value: a double in fixed notation with that
    // many decimals in the default locale, anything else as its text. Always a variant
    // holding a QString (empty for a null model or an invalid index).
    static QVariant displayDataFormater(const QAbstractItemModel *model, const QModelIndex &index, int decimals);
    // "0." followed by one "0" per decimal ("0." for none, "0.00" for two).
    static QString doubleDataFormater(int decimals);
};

} // namespace vexa
