#pragma once

#include "common/FileDialogs.h"
#include "common/Messages.h"

class QWidget;

namespace pelmar {

// Message boxes on screen, right-to-left.
class QtMessages : public Messages {
public:
    explicit QtMessages(QWidget* parent = nullptr) : parent_(parent) {}
    bool question(const QString& title, const QString& text) override;
    void information(const QString& title, const QString& text) override;
    void critical(const QString& title, const QString& text) override;
    void exclamation(const QString& text) override;
    void plain(const QString& text) override;

private:
    QWidget* parent_;
};

// The desktop's file dialogs.
class QtFileDialogs : public FileDialogs {
public:
    explicit QtFileDialogs(QWidget* parent = nullptr) : parent_(parent) {}
    QString openFile(const QString& filter, int filterIndex) override;
    QString saveFile(const QString& filter, int filterIndex, const QString& defaultName) override;

private:
    QWidget* parent_;
};

// "All Files (*.*)|*.*|Word Files (*.doc)|*.doc" as the Qt dialogs write filters, each label
// once and "*.*" as every file: "All Files (*)", "Word Files (*.doc)".
QStringList qtFilters(const QString& classicFilter);

}  // namespace pelmar
