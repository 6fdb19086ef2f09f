#pragma once

/// \file
/// The facts that a row of the catalogue of pixel formats is made of, and the making of a format from them. A row that
/// contradicts itself does not compile.

#include "zonmediatypes/PixelFormat.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace zonmediatypes::catalogue
{

// One type a fact, so that a fact in the wrong column does not compile.
enum class Model : bool
{
	RGB,
	YUV
};
enum class Matrix : bool
{
	Rec601,
	Rec709
};
enum class Range : bool
{
	Full,
	Video
};
enum class Order : bool
{
	Usual,
	Reversed
};
enum class Light : bool
{
	Gamma,
	Linear
};
using enum Model;
using enum Matrix;
using enum Range;
using enum Order;
using enum Light;

struct Depth
{
	PixelFormatBitDepth mCode;
	bool mIsFloat;
	std::string_view mText;   // as the names of constants have it
};
inline constexpr Depth D8u{kPixelFormatBitDepth_8, false, "8u"};
inline constexpr Depth D10u{kPixelFormatBitDepth_10, false, "10u"};
inline constexpr Depth D15u{kPixelFormatBitDepth_15, false, "15u"};
inline constexpr Depth D32f{kPixelFormatBitDepth_32, true, "32f"};

struct Chroma
{
	PixelFormatSubsampling mCode;
	std::string_view mText;
};
// NOLINTBEGIN(readability-identifier-naming): rows read as their words do
inline constexpr Chroma C4444{kPixelFormatSubsampling_444, "4444"};
inline constexpr Chroma C444{kPixelFormatSubsampling_444, "444"};
inline constexpr Chroma C422{kPixelFormatSubsampling_422, "422"};
inline constexpr Chroma C420{kPixelFormatSubsampling_420, "420"};
inline constexpr Chroma DV{kPixelFormatSubsampling_DV, ""};

inline constexpr auto None = kPixelFormatAlpha_None;
inline constexpr auto Straight = kPixelFormatAlpha_Straight;
inline constexpr auto Premultiplied = kPixelFormatAlpha_Premultiplied;
inline constexpr auto Ignored = kPixelFormatAlpha_Ignored;

inline constexpr auto Uncompressed = kPixelFormatCompression_None;
inline constexpr auto NTSCDV25 = kPixelFormatCompression_NTSCDV25;
inline constexpr auto PALDV25 = kPixelFormatCompression_PALDV25;
inline constexpr auto NTSCDV50 = kPixelFormatCompression_NTSCDV50;
inline constexpr auto PALDV50 = kPixelFormatCompression_PALDV50;
inline constexpr auto NTSCDV100_720p = kPixelFormatCompression_NTSCDV100_720p;
inline constexpr auto PALDV100_720p = kPixelFormatCompression_PALDV100_720p;
inline constexpr auto NTSCDV100_1080i = kPixelFormatCompression_NTSCDV100_1080i;
inline constexpr auto PALDV100_1080i = kPixelFormatCompression_PALDV100_1080i;
inline constexpr auto MPEG2Field = kPixelFormatCompression_MPEG2Field;
inline constexpr auto MPEG2Frame = kPixelFormatCompression_MPEG2Frame;
inline constexpr auto MPEG4Field = kPixelFormatCompression_MPEG4Field;
inline constexpr auto MPEG4Frame = kPixelFormatCompression_MPEG4Frame;
// NOLINTEND(readability-identifier-naming)

// Whether inWord stands in a constant's name, between underscores.
consteval bool Says(std::string_view inName, std::string_view inWord)
{
	for (std::size_t begin = 0; begin <= inName.size();)
	{
		const std::size_t end = std::min(inName.find('_', begin), inName.size());
		if (inName.substr(begin, end - begin) == inWord)
			return true;
		begin = end + 1;
	}
	return false;
}

// A format's name and facts, before they are checked.
struct Row
{
	std::string_view mConstant;
	PixelFormatName mName;
	Model mModel;
	Depth mDepth;
	Matrix mMatrix;
	Range mRange;
	PixelFormatAlpha mAlpha;
	Chroma mChroma;
	Order mOrder = Usual;
	Light mLight = Gamma;
	PixelFormatCompression mCompression = Uncompressed;

	consteval Row(std::string_view inConstant, PixelFormatName inName, Model inModel, Depth inDepth, Matrix inMatrix,
		Range inRange, PixelFormatAlpha inAlpha, Chroma inChroma, Order inOrder = Usual, Light inLight = Gamma)
		: mConstant(inConstant),
		  mName(inName),
		  mModel(inModel),
		  mDepth(inDepth),
		  mMatrix(inMatrix),
		  mRange(inRange),
		  mAlpha(inAlpha),
		  mChroma(inChroma),
		  mOrder(inOrder),
		  mLight(inLight)
	{
	}
	consteval Row(std::string_view inConstant, PixelFormatName inName, Model inModel, Depth inDepth, Matrix inMatrix,
		Range inRange, PixelFormatAlpha inAlpha, Chroma inChroma, PixelFormatCompression inCompression)
		: Row(inConstant, inName, inModel, inDepth, inMatrix, inRange, inAlpha, inChroma)
	{
		mCompression = inCompression;
	}
};

consteval PixelFormatProperties Properties(const Row& inRow)
{
	PixelFormatProperties properties(0);
	properties.SetIsYUV(inRow.mModel == YUV);
	properties.SetBitDepth(inRow.mDepth.mCode);
	properties.SetIsFloat(inRow.mDepth.mIsFloat);
	properties.SetIs709(inRow.mMatrix == Rec709);
	properties.SetIsVideoRange(inRow.mRange == Video);
	properties.SetAlpha(inRow.mAlpha);
	properties.SetSubsampling(inRow.mChroma.mCode);
	properties.SetReversedOrder(inRow.mOrder == Reversed);
	properties.SetIsLinear(inRow.mLight == Linear);
	properties.SetCompression(inRow.mCompression);
	properties.SetKind(kPixelFormatKind_Concrete);
	return properties;
}

// Facts that no format has together do not compile.
consteval void CheckFacts(PixelFormatProperties inProperties)
{
	if (!inProperties.IsYUV() && (inProperties.Is709() || inProperties.IsVideoRange()))
		throw "an RGB row names a YUV matrix or range";
	if (inProperties.IsYUV() && inProperties.IsLinear())
		throw "a YUV row is in linear light";
	if (inProperties.IsLinear() && !inProperties.IsFloat())
		throw "integer components are in linear light";
	if (!inProperties.IsYUV() && inProperties.Subsampling() != kPixelFormatSubsampling_444)
		throw "an RGB row has subsampled chroma";
	if (inProperties.Alpha() != kPixelFormatAlpha_None && inProperties.Subsampling() != kPixelFormatSubsampling_444)
		throw "a row with subsampled chroma has an alpha component";
	if (inProperties.IsDV() != (inProperties.Subsampling() == kPixelFormatSubsampling_DV))
		throw "the DV chroma layout is that of DV, and of nothing else";
	if (inProperties.IsMPEG() != (inProperties.Subsampling() == kPixelFormatSubsampling_420))
		throw "planar 4:2:0 is that of MPEG, and of nothing else";
	if (inProperties.IsCompressed() && (!inProperties.IsYUV() || inProperties.BitDepth() != kPixelFormatBitDepth_8))
		throw "a compressed row is not of 8-bit YUV";
}

// A constant's name that says something else than the facts does not compile. DV formats are named by their standard.
consteval void CheckName(const Row& inRow)
{
	if (inRow.mChroma.mCode == kPixelFormatSubsampling_DV)
		return;
	if (!Says(inRow.mConstant, inRow.mDepth.mText) || !Says(inRow.mConstant, inRow.mChroma.mText))
		throw "the name has another depth or another chroma than the row";
	if (Says(inRow.mConstant, "709") != (inRow.mMatrix == Rec709))
		throw "the name has another matrix than the row";
	if (Says(inRow.mConstant, "Linear") != (inRow.mLight == Linear))
		throw "the name has another light than the row";
	if (Says(inRow.mConstant, "FullRange") != (inRow.mModel == YUV && inRow.mRange == Full))
		throw "the name has another range than the row";
	if (Says(inRow.mConstant, "4444") != (inRow.mAlpha != None))
		throw "the name has another number of components than the row";
}

consteval PixelFormat Format(const Row& inRow)
{
	const PixelFormatProperties properties = Properties(inRow);
	CheckFacts(properties);
	CheckName(inRow);
	return {inRow.mName, properties};
}

}   // namespace zonmediatypes::catalogue
