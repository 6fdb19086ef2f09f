#pragma once

/// \file
/// Integer arithmetic that is defined for every pair of operands: what overflows wraps around as two's complement does.
///
/// Overflow of the built-in operators is undefined; a call of one of these says that wrapping is meant. Sums, differences
/// and products cost what the built-in operators cost, quotients and remainders two comparisons more.

#include "zoncore/Export.h"

#include <concepts>
#include <type_traits>

namespace zoncore::utility
{

/// Ends the process as a division by zero of the processor does, by raising SIGFPE; never returns.
[[noreturn]] ZONCORE_API void RaiseDivideFault() noexcept;

/// The integers that the operators below take: signed, and not promoted by the built-in operators.
template <class T>
concept WrappingInteger = std::signed_integral<T> && sizeof(T) >= sizeof(int);

template <WrappingInteger Integer>
constexpr Integer WrappingAdd(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
	using Unsigned = std::make_unsigned_t<Integer>;
	return static_cast<Integer>(static_cast<Unsigned>(inLHS) + static_cast<Unsigned>(inRHS));
}

template <WrappingInteger Integer>
constexpr Integer WrappingSubtract(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
	using Unsigned = std::make_unsigned_t<Integer>;
	return static_cast<Integer>(static_cast<Unsigned>(inLHS) - static_cast<Unsigned>(inRHS));
}

template <WrappingInteger Integer>
constexpr Integer WrappingMultiply(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
	using Unsigned = std::make_unsigned_t<Integer>;
	return static_cast<Integer>(static_cast<Unsigned>(inLHS) * static_cast<Unsigned>(inRHS));
}

/// The most negative value is its own negative.
template <WrappingInteger Integer>
constexpr Integer WrappingNegate(Integer inValue) noexcept
{
	return WrappingSubtract(Integer{0}, inValue);
}

/// |inValue| as an unsigned number, which the most negative value fits into, too.
template <WrappingInteger Integer>
constexpr std::make_unsigned_t<Integer> Magnitude(Integer inValue) noexcept
{
	return static_cast<std::make_unsigned_t<Integer>>(inValue < 0 ? WrappingNegate(inValue) : inValue);
}

/// The quotient truncated toward zero; the most negative value divided by -1 is itself. A divisor of 0 is a divide fault,
/// in a constant expression an error.
template <WrappingInteger Integer>
constexpr Integer WrappingDivide(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
	if (inRHS == 0)
		RaiseDivideFault();
	return inRHS == -1 ? WrappingNegate(inLHS) : inLHS / inRHS;
}

/// The remainder of WrappingDivide, with the sign of inLHS.
template <WrappingInteger Integer>
constexpr Integer WrappingRemainder(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
	if (inRHS == 0)
		RaiseDivideFault();
	return inRHS == -1 ? 0 : inLHS % inRHS;
}

}   // namespace zoncore::utility
