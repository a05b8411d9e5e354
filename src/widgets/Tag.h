#pragma once

#include <QObject>
#include <QString>
#include <QVariant>

namespace pelmar {

// A control's tag: free text a control carries for the code that reads it (the department
// toggle's field choice, a merge row's kind, a merge row's result column).
inline QString tagOf(const QObject* control)
{
    return control->property("Tag").toString();
}

inline void setTag(QObject* control, const QString& tag)
{
    control->setProperty("Tag", tag);
}

}  // namespace pelmar
