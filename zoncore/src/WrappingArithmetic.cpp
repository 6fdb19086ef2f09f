#include "zoncore/WrappingArithmetic.h"

#include "zoncore/src/System.h"

void zoncore::utility::RaiseDivideFault() noexcept
{
	system::RaiseDivideFault();
}
