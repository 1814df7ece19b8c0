// SPDX-License-Identifier: Apache-2.0
//
// What a client of regions needs: the process's region system, the abstract region, the general
// region and the handlers. Objects and texts are made with the helpers of region_objects.h.

#pragma once

// IWYU pragma: begin_exports
#include "alloclib/interface/handlers.h"
#include "alloclib/interface/process.h"
#include "alloclib/interface/region_base.h"
#include "alloclib/interface/region_general.h"
// IWYU pragma: end_exports
