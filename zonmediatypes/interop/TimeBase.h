#pragma once

/// \file
/// The former place of zonmediatypes/TimeBase.h, for hosts that include it from here.

#include "zonmediatypes/TimeBase.h"
