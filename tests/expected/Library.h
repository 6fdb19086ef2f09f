#pragma once

#include "zoncore/Expected.h"

#include <string>

/// One half of a library: built as C++20, whatever its host is built as.
zoncore::Expected<std::string, int> NameOf(int inNumber);
int LengthOf(const zoncore::Expected<std::string, int>& inName);
