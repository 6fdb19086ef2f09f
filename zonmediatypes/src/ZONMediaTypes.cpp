#include "zonmediatypes/ZONMediaTypes.h"

#include "zoncore/RecursiveMutex.h"
#include "zonmediatypes/src/InitializationCount.h"

namespace zonmediatypes
{
namespace
{

zoncore::threads::RecursiveMutex sCriticalSection;
std::int32_t sInitializationCount;

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
