#pragma once

#include <QString>
#include <QStringList>

class QCheckBox;
class QComboBox;
class QGridLayout;
class QGroupBox;
class QLabel;
class QLineEdit;
class QPushButton;
class QWidget;

namespace pelmar {

// Small factories for the pages: each control gets its code name as objectName.
// A control array entry is named "<name>_<index>".
QString arrayName(const char* name, int index);

QLabel* caption(const QString& text, const QString& name = {});
QCheckBox* checkBox(const QString& name, const QString& text = {});
QLineEdit* textBox(const QString& name, const QString& text = {});
QComboBox* listBox(const QString& name, const QStringList& items);
QPushButton* button(const QString& name, const QString& text);

// A titled group whose content is laid out on a grid.
QGroupBox* groupBox(const QString& title, QGridLayout*& grid);

}  // namespace pelmar
