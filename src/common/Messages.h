#pragma once

#include <QString>

namespace pelmar {

// The message boxes the system shows. Every box is modal; the caller waits for the answer.
class Messages {
public:
    virtual ~Messages() = default;

    // A Yes/No question with the question icon; true for Yes.
    virtual bool question(const QString& title, const QString& text) = 0;
    // An information box with an OK button.
    virtual void information(const QString& title, const QString& text) = 0;
    // A critical box with an OK button ("תקלה" for failures, "שגיאה" for missing options).
    virtual void critical(const QString& title, const QString& text) = 0;
    // A warning box with the exclamation icon and no title of its own.
    virtual void exclamation(const QString& text) = 0;
    // A box with an OK button only, no icon and no title of its own.
    virtual void plain(const QString& text) = 0;
};

}  // namespace pelmar
