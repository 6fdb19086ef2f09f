#include "zoncore/WrappingArithmetic.h"

#include <csignal>
#include <cstdlib>

void zoncore::utility::RaiseDivideFault() noexcept
{
	std::raise(SIGFPE);
	std::abort();   // a handler of the host's that returns must not resume a division that has no result
}
