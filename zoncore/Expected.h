#pragma once

/// \file
/// A value, or the reason why there is none.
///
///     const Expected<TickTime, TimecodeProblem> time = ReadTimecode(text, counting);
///     if (time)
///         Show(*time);
///     else
///         Show(Description(time.error()));
///
/// The interface and its names are those of C++23's std::expected, to which it converts, and from which, where a host's
/// library has one. It is never an alias of it: a host and a library that are built as different versions of C++ mean the
/// same type. Copying, moving and destroying cost what they cost for the value or the reason, and are trivial where those
/// are.

#include "zoncore/Requirements.h"

#include <concepts>
#include <cstddef>
#include <exception>
#include <initializer_list>
#include <type_traits>
#include <utility>
#include <variant>
#include <version>

#ifdef __cpp_lib_expected
	#include <expected>
#endif

namespace zoncore
{

/// What value() throws where there is none.
template <class E>
class BadExpectedAccess;

// Doxygen takes a class whose base is a specialisation of it for one that inherits from itself.
/// \cond
template <>
class BadExpectedAccess<void> : public std::exception
{
public:
	const char* what() const noexcept override { return "there is a reason in place of the value"; }
};

template <class E>
class BadExpectedAccess : public BadExpectedAccess<void>
{
public:
	explicit BadExpectedAccess(E inError) : mError(std::move(inError)) {}

	const E& error() const& noexcept { return mError; }
	E& error() & noexcept { return mError; }
	E&& error() && noexcept { return std::move(mError); }

private:
	E mError;
};
/// \endcond

template <class T, class E>
class Expected;
template <class E>
class Unexpected;

namespace detail
{

template <class Type>
inline constexpr bool kIsExpected = false;
template <class T, class E>
inline constexpr bool kIsExpected<Expected<T, E>> = true;
template <class Type>
inline constexpr bool kIsUnexpected = false;
template <class E>
inline constexpr bool kIsUnexpected<Unexpected<E>> = true;

/// What Expected<void, E> holds in place of a value.
template <class T>
using HeldValue = std::conditional_t<std::is_void_v<T>, std::monostate, T>;

/// Neither a value nor a reason in a wrapping of this header.
template <class Type>
concept Plain = !kIsExpected<std::remove_cvref_t<Type>> && !kIsUnexpected<std::remove_cvref_t<Type>>;

/// Makes the value of an Expected<T, E>.
template <class Type, class T>
concept ValueFor = Plain<Type> && !std::is_void_v<T> && std::constructible_from<HeldValue<T>, Type>;

/// Makes the reason of an Unexpected<E>.
template <class Type, class E>
concept ReasonFor
	= Plain<Type> && !std::same_as<std::remove_cvref_t<Type>, std::in_place_t> && std::constructible_from<E, Type>;

}   // namespace detail

/// A reason, to be returned where an Expected is.
template <class E>
class Unexpected
{
public:
	template <class Error = E>
		requires detail::ReasonFor<Error, E>
	explicit constexpr Unexpected(Error&& inError) : mError(std::forward<Error>(inError)) {}
	template <class... Arguments>
		requires std::constructible_from<E, Arguments...>
	explicit constexpr Unexpected(std::in_place_t, Arguments&&... inArguments)
		: mError(std::forward<Arguments>(inArguments)...)
	{
	}

	constexpr const E& error() const& noexcept { return mError; }
	constexpr E& error() & noexcept { return mError; }
	constexpr E&& error() && noexcept { return std::move(mError); }

	friend constexpr bool operator==(const Unexpected& inLHS, const Unexpected& inRHS)
	{
		return inLHS.mError == inRHS.mError;
	}

private:
	E mError;
};

template <class E>
Unexpected(E) -> Unexpected<E>;

/// Says that what follows makes the reason.
struct UnexpectedTag
{
	explicit UnexpectedTag() = default;
};
inline constexpr UnexpectedTag unexpect{};

namespace detail
{

/// Calls a function, or takes a member of inValue.
template <class Function, class Value>
constexpr decltype(auto) Call(Function&& inFunction, Value&& inValue)
{
	if constexpr (std::is_member_function_pointer_v<std::remove_cvref_t<Function>>)
		return (std::forward<Value>(inValue).*inFunction)();
	else if constexpr (std::is_member_object_pointer_v<std::remove_cvref_t<Function>>)
		return std::forward<Value>(inValue).*inFunction;
	else
		return std::forward<Function>(inFunction)(std::forward<Value>(inValue));
}

}   // namespace detail

/// A T or an E. T may be void: then only success is told, and the value is a std::monostate. An exception that changing it throws leaves it with neither only
/// where moving a value or a reason throws, which no type of this project's does.
template <class T, class E>
class Expected
{
	using Held = detail::HeldValue<T>;

public:
	using value_type = T;
	using error_type = E;
	using unexpected_type = Unexpected<E>;
	template <class U>
	using rebind = Expected<U, E>;

	// ---- Making one --------------------------------------------------------------------------------------------------

	constexpr Expected() = default;

	template <class U = T>
		requires detail::ValueFor<U, T>
	explicit(!std::convertible_to<U, Held>) constexpr Expected(U&& inValue)
		: mState(std::in_place_index<0>, std::forward<U>(inValue))
	{
	}

	template <class G>
		requires std::constructible_from<E, const G&>
	explicit(!std::convertible_to<const G&, E>) constexpr Expected(const Unexpected<G>& inReason)
		: mState(std::in_place_index<1>, inReason.error())
	{
	}
	template <class G>
		requires std::constructible_from<E, G>
	explicit(!std::convertible_to<G, E>) constexpr Expected(Unexpected<G>&& inReason)
		: mState(std::in_place_index<1>, std::move(inReason).error())
	{
	}

	template <class... Arguments>
		requires std::constructible_from<Held, Arguments...>
	explicit constexpr Expected(std::in_place_t, Arguments&&... inArguments)
		: mState(std::in_place_index<0>, std::forward<Arguments>(inArguments)...)
	{
	}
	template <class Item, class... Arguments>
		requires std::constructible_from<Held, std::initializer_list<Item>, Arguments...>
	explicit constexpr Expected(std::in_place_t, std::initializer_list<Item> inItems, Arguments&&... inArguments)
		: mState(std::in_place_index<0>, inItems, std::forward<Arguments>(inArguments)...)
	{
	}
	template <class... Arguments>
		requires std::constructible_from<E, Arguments...>
	explicit constexpr Expected(UnexpectedTag, Arguments&&... inArguments)
		: mState(std::in_place_index<1>, std::forward<Arguments>(inArguments)...)
	{
	}

	/// Makes a new value in place of what is there.
	template <class... Arguments>
		requires std::constructible_from<Held, Arguments...>
	constexpr Held& emplace(Arguments&&... inArguments)
	{
		return mState.template emplace<0>(std::forward<Arguments>(inArguments)...);
	}

	constexpr void swap(Expected& ioOther) { mState.swap(ioOther.mState); }
	friend constexpr void swap(Expected& ioLHS, Expected& ioRHS) { ioLHS.swap(ioRHS); }

	// ---- Looking into one --------------------------------------------------------------------------------------------

	constexpr bool has_value() const noexcept { return mState.index() == 0; }
	explicit constexpr operator bool() const noexcept { return has_value(); }

	/// The value. Where there is none the process ends: ask first.
	constexpr const Held& operator*() const& noexcept { return std::get<0>(mState); }
	constexpr Held& operator*() & noexcept { return std::get<0>(mState); }
	constexpr Held&& operator*() && noexcept { return std::get<0>(std::move(mState)); }
	constexpr const Held* operator->() const noexcept { return &std::get<0>(mState); }
	constexpr Held* operator->() noexcept { return &std::get<0>(mState); }

	/// The value; throws BadExpectedAccess<E> where there is none.
	constexpr decltype(auto) value() const& { return Checked(*this), *(*this); }
	constexpr decltype(auto) value() & { return Checked(*this), *(*this); }
	constexpr decltype(auto) value() && { return Checked(std::move(*this)), *std::move(*this); }

	/// The reason. Where there is a value the process ends: ask first.
	constexpr const E& error() const& noexcept { return std::get<1>(mState); }
	constexpr E& error() & noexcept { return std::get<1>(mState); }
	constexpr E&& error() && noexcept { return std::get<1>(std::move(mState)); }

	template <class U>
	constexpr Held value_or(U&& inOther) const&
	{
		return has_value() ? **this : static_cast<Held>(std::forward<U>(inOther));
	}
	template <class U>
	constexpr Held value_or(U&& inOther) &&
	{
		return has_value() ? *std::move(*this) : static_cast<Held>(std::forward<U>(inOther));
	}
	template <class G = E>
	constexpr E error_or(G&& inOther) const
	{
		return has_value() ? static_cast<E>(std::forward<G>(inOther)) : error();
	}

	// ---- Going on with what it holds ---------------------------------------------------------------------------------

	/// inFunction of the value, which gives an Expected with the same kind of reason; else the reason.
	template <class Function>
	constexpr auto and_then(Function&& inFunction) const&
	{
		using Result = std::remove_cvref_t<decltype(CallWithValue(std::forward<Function>(inFunction), *this))>;
		return has_value() ? CallWithValue(std::forward<Function>(inFunction), *this) : Result(unexpect, error());
	}
	template <class Function>
	constexpr auto and_then(Function&& inFunction) &&
	{
		using Result
			= std::remove_cvref_t<decltype(CallWithValue(std::forward<Function>(inFunction), std::move(*this)))>;
		return has_value() ? CallWithValue(std::forward<Function>(inFunction), std::move(*this))
						   : Result(unexpect, std::move(*this).error());
	}

	/// inFunction of the value as a value; else the reason.
	template <class Function>
	constexpr auto transform(Function&& inFunction) const&
	{
		return Transformed(std::forward<Function>(inFunction), *this);
	}
	template <class Function>
	constexpr auto transform(Function&& inFunction) &&
	{
		return Transformed(std::forward<Function>(inFunction), std::move(*this));
	}

	/// The value; else inFunction of the reason, which gives an Expected with the same kind of value.
	template <class Function>
	constexpr auto or_else(Function&& inFunction) const
	{
		using Result = std::remove_cvref_t<decltype(detail::Call(std::forward<Function>(inFunction), error()))>;
		if (!has_value())
			return detail::Call(std::forward<Function>(inFunction), error());
		if constexpr (std::is_void_v<T>)
			return Result();
		else
			return Result(std::in_place, **this);
	}

	/// The value; else inFunction of the reason as a reason.
	template <class Function>
	constexpr auto transform_error(Function&& inFunction) const
	{
		using Reason = std::remove_cvref_t<decltype(detail::Call(std::forward<Function>(inFunction), error()))>;
		using Result = Expected<T, Reason>;
		if (!has_value())
			return Result(unexpect, detail::Call(std::forward<Function>(inFunction), error()));
		if constexpr (std::is_void_v<T>)
			return Result();
		else
			return Result(std::in_place, **this);
	}

	// ---- Comparing ---------------------------------------------------------------------------------------------------

	friend constexpr bool operator==(const Expected& inLHS, const Expected& inRHS)
	{
		if (inLHS.has_value() != inRHS.has_value())
			return false;
		if (!inLHS.has_value())
			return inLHS.error() == inRHS.error();
		if constexpr (std::is_void_v<T>)
			return true;
		else
			return *inLHS == *inRHS;
	}
	template <class U>
		requires detail::Plain<U>
	friend constexpr bool operator==(const Expected& inLHS, const U& inValue)
	{
		return inLHS.has_value() && *inLHS == inValue;
	}
	template <class G>
	friend constexpr bool operator==(const Expected& inLHS, const Unexpected<G>& inReason)
	{
		return !inLHS.has_value() && inLHS.error() == inReason.error();
	}

#ifdef __cpp_lib_expected
	// ---- The standard one --------------------------------------------------------------------------------------------

	constexpr Expected(const std::expected<T, E>& inOther)   // NOLINT(google-explicit-constructor): the same thing
		: Expected(inOther ? FromStandard(inOther) : Expected(unexpect, inOther.error()))
	{
	}
	constexpr operator std::expected<T, E>() const   // NOLINT(google-explicit-constructor)
	{
		if (!has_value())
			return std::unexpected<E>(error());
		if constexpr (std::is_void_v<T>)
			return {};
		else
			return **this;
	}
#endif

private:
	template <class Self>
	static constexpr void Checked(Self&& inSelf)
	{
		if (!inSelf.has_value())
			throw BadExpectedAccess<E>(std::forward<Self>(inSelf).error());
	}

	template <class Function, class Self>
	static constexpr decltype(auto) CallWithValue(Function&& inFunction, Self&& inSelf)
	{
		if constexpr (std::is_void_v<T>)
			return std::forward<Function>(inFunction)();
		else
			return detail::Call(std::forward<Function>(inFunction), *std::forward<Self>(inSelf));
	}

	template <class Function, class Self>
	static constexpr auto Transformed(Function&& inFunction, Self&& inSelf)
	{
		using Value
			= std::remove_cv_t<decltype(CallWithValue(std::forward<Function>(inFunction), std::forward<Self>(inSelf)))>;
		using Result = Expected<Value, E>;
		if (!inSelf.has_value())
			return Result(unexpect, std::forward<Self>(inSelf).error());
		if constexpr (std::is_void_v<Value>)
			return CallWithValue(std::forward<Function>(inFunction), std::forward<Self>(inSelf)), Result();
		else
			return Result(std::in_place, CallWithValue(std::forward<Function>(inFunction), std::forward<Self>(inSelf)));
	}

#ifdef __cpp_lib_expected
	static constexpr Expected FromStandard(const std::expected<T, E>& inOther)
	{
		if constexpr (std::is_void_v<T>)
			return {};
		else
			return Expected(std::in_place, *inOther);
	}
#endif

	std::variant<Held, E> mState;
};

}   // namespace zoncore
