#include "zonmediatypes/ZONMediaTypes.h"

#include "zoncore/RecursiveMutex.h"
#include "zonmediatypes/src/InitializationCount.h"
#include "zonmediatypes/src/SelfCheck.h"

namespace zonmediatypes
{
namespace
{

zoncore::threads::RecursiveMutex sCriticalSection;
std::int32_t sInitializationCount;

// At load. It stands beside the entry points because a static link takes what they stand in, and leaves out an object
// file that nothing refers to.
[[maybe_unused]] const bool sHasSelfChecks = (RegisterSelfChecks(), true);

// Holds sCriticalSection for the length of a block.
class CriticalSectionLock
{
public:
	explicit CriticalSectionLock(const char* inName) { sCriticalSection.Lock(inName); }
	CriticalSectionLock(const CriticalSectionLock&) = delete;
	CriticalSectionLock& operator=(const CriticalSectionLock&) = delete;
	~CriticalSectionLock() { sCriticalSection.Unlock(); }
};

}   // namespace

void Initialize()
{
	const CriticalSectionLock lock("void zonmediatypes::Initialize()");
	++sInitializationCount;
}

void Terminate()
{
	const CriticalSectionLock lock("void zonmediatypes::Terminate()");
	--sInitializationCount;
}

std::int32_t InitializationCount()
{
	const CriticalSectionLock lock("std::int32_t zonmediatypes::InitializationCount()");
	return sInitializationCount;
}

}   // namespace zonmediatypes
