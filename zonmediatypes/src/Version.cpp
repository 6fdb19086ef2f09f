#include "zonmediatypes/Version.h"

const char* zonmediatypes::Version() noexcept
{
	return ZONMEDIATYPES_VERSION_STRING;
}
