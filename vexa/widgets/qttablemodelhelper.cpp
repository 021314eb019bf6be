#include "qttablemodelhelper.h"

#include <QAbstractItemModel>
#include <QLocale>

#include <algorithm>

namespace vexa {

QVariant QtTableModelHelper::displayDataFormater(const QAbstractItemModel *model, const QModelIndex &index,
                                                 int decimals)
{
    if (!model || !index.isValid() || index.model() != model)
        return QVariant(QString());
    const QVariant value = model->data(index, ExportValueRole);
    if (value.userType() == QMetaType::Double || value.userType() == QMetaType::Float)
        return QVariant(QLocale().toString(value.toDouble(), 'f', std::max(0, decimals)));
    return QVariant(value.toString());
}

QString QtTableModelHelper::doubleDataFormater(int decimals)
{
    return QStringLiteral("0.") + QString(std::max(0, decimals), QLatin1Char('0'));
}

} // namespace vexa
