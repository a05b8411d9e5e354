// A core source that reaches up into the window: the build must refuse it.
#include "common/Failure.h"
#include "control/MainCard.h"
