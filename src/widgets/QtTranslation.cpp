#include "widgets/QtTranslation.h"

#include <QCoreApplication>
#include <QLibraryInfo>
#include <QLocale>
#include <QTranslator>

using namespace Qt::StringLiterals;

namespace pelmar {

bool installQtHebrew(QTranslator& translator)
{
    const bool loaded = translator.load(QLocale(QLocale::Hebrew), u"qtbase"_s, u"_"_s,
                                        QLibraryInfo::path(QLibraryInfo::TranslationsPath));
    return loaded && QCoreApplication::installTranslator(&translator);
}

}  // namespace pelmar
