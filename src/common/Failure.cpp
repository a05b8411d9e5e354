#include "common/Failure.h"

#include <utility>

namespace pelmar {

Failure::Failure(QString description, long number)
    : description_(std::move(description)), number_(number), utf8_(description_.toUtf8())
{}

}  // namespace pelmar
