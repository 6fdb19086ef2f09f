#pragma once

#include "zoncore/Mutex.h"

#if ZONCORE_HAS_THREADS
	#include <boost/thread/mutex.hpp>
#endif

namespace zonmediatypes
{

/// The mutex of the registry of custom pixel formats; a lock that fails throws boost::lock_error. It needs Boost's headers
/// alone, none of its libraries.
#if ZONCORE_HAS_THREADS
using RegistryMutex = boost::mutex;
#else
using RegistryMutex = zoncore::threads::Mutex;
#endif

}   // namespace zonmediatypes
