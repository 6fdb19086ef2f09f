#include "zonmediatypes/Descriptions.h"

#include "zonmediatypes/src/TextKeys.h"

namespace zonmediatypes
{

// ---- Time ------------------------------------------------------------------------------------------------------------

// ---- Audio -----------------------------------------------------------------------------------------------------------

// ---- Video -----------------------------------------------------------------------------------------------------------

// ---- Keys ------------------------------------------------------------------------------------------------------------

namespace
{

constexpr auto sAllTextKeys = JoinKeys();

}   // namespace

std::span<const std::string_view> AllTextKeys() noexcept
{
	return sAllTextKeys;
}

}   // namespace zonmediatypes
