#pragma once

/// \file
/// Points and rectangles as plain aggregates.

#include "zoncore/Requirements.h"

namespace zoncore
{

/// A point, or a size with `x` as width and `y` as height.
template <class T>
struct PointT
{
	T x{};
	T y{};

	friend constexpr bool operator==(const PointT&, const PointT&) = default;
};

/// A rectangle by its four edges. Functions that take a frame's rectangle read `right` as its width and `bottom` as its
/// height: such rectangles are anchored at the origin.
template <class T>
struct RectT
{
	T left{};
	T top{};
	T right{};
	T bottom{};

	friend constexpr bool operator==(const RectT&, const RectT&) = default;
};

}   // namespace zoncore
