#include "designer/run/shownNumber.h"

#include <QLocale>

namespace zandor::designer {

QString shownNumber(const QString& number) {
    return QString(number).replace(u'.', QLocale().decimalPoint());
}

} // namespace zandor::designer
