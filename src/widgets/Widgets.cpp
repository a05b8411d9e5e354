#include "widgets/Widgets.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

namespace pelmar {

QString arrayName(const char* name, int index)
{
    return QLatin1String(name) + u'_' + QString::number(index);
}

QLabel* caption(const QString& text, const QString& name)
{
    auto* label = new QLabel(text);
    if (!name.isEmpty())
        label->setObjectName(name);
    return label;
}

QCheckBox* checkBox(const QString& name, const QString& text)
{
    auto* box = new QCheckBox(text);
    box->setObjectName(name);
    return box;
}

QLineEdit* textBox(const QString& name, const QString& text)
{
    auto* edit = new QLineEdit(text);
    edit->setObjectName(name);
    return edit;
}

QComboBox* listBox(const QString& name, const QStringList& items)
{
    auto* combo = new QComboBox;
    combo->setObjectName(name);
    combo->addItems(items);
    return combo;
}

QPushButton* button(const QString& name, const QString& text)
{
    auto* push = new QPushButton(text);
    push->setObjectName(name);
    return push;
}

QGroupBox* groupBox(const QString& title, QGridLayout*& grid)
{
    auto* group = new QGroupBox(title);
    grid = new QGridLayout(group);
    return group;
}

}  // namespace pelmar
