// Count of live objects and explicit server locks; the module may unload only when it is zero.
#pragma once

#include "platform/com_types.h"

void ModuleLockIncrement();
void ModuleLockDecrement();
LONG ModuleLockCount();
