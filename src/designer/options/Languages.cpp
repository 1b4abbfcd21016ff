#include "designer/options/Languages.h"

#include <QCoreApplication>
#include <QLibraryInfo>
#include <QTranslator>

namespace zandor::designer {

bool loadCatalogue(QTranslator& translator, const QLocale& locale) {
    return translator.load(locale, QStringLiteral("zandor_designer"), QStringLiteral("_"),
                           QStringLiteral(":/translations"));
}

void speak(const QLocale& locale) {
    auto* const application = QCoreApplication::instance();
    auto* const own = new QTranslator(application);
    if (loadCatalogue(*own, locale)) QCoreApplication::installTranslator(own);
    auto* const qt = new QTranslator(application);
    // Qt's buttons speak the language that the designer does, not the next best that they know.
    if (!own->isEmpty() && qt->load(QStringLiteral("qtbase_") + own->language().section(u'_', 0, 0),
                                    QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(qt);
}

} // namespace zandor::designer
