#pragma once
// The constants each class publishes: the library's enumerations as "Name = value" declarations.
#include <cstddef>

#include "host_sdk.h"

namespace quire_plugin {

struct ConstantList {
    REALconstant* list;
    size_t count;
};

ConstantList filterColumnConstants();
ConstantList formatConstants();
ConstantList fontConstants();
ConstantList sheetConstants();
ConstantList bookConstants();

}  // namespace quire_plugin
