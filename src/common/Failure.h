#pragma once

#include <QByteArray>
#include <QString>

#include <exception>

namespace pelmar {

// A failure that ends an operation. Its description is written for the user: the handler that
// catches it shows the description as it stands (usually in a critical box titled "תקלה").
class Failure : public std::exception {
public:
    // The number the classic database client reported for an unspecified provider failure.
    static constexpr long kUnspecified = -2147467259;

    explicit Failure(QString description, long number = kUnspecified);

    const QString& description() const { return description_; }
    long number() const { return number_; }
    const char* what() const noexcept override { return utf8_.constData(); }

private:
    QString description_;
    long number_;
    QByteArray utf8_;
};

}  // namespace pelmar
