// Factories of the stand-in classes; each returns an object holding one reference.
#pragma once

#include "dispatch.h"

namespace hoststandin {

DispatchObject* newZarnPlan();
DispatchObject* newProtect();
DispatchObject* newConnection();
DispatchObject* newRecordset();

} // namespace hoststandin
