#pragma once

/// \file
/// What a pixel format is, in 32 bits: colour model, depth, alpha, chroma layout, compression.
///
///      31..20 19 18    17..14     13      12    11 10   9..7   6    5    4    3..1  0
///     +------+-----+-----------+------+--------+------+-----+-----+---+-----+-----+---+
///     |unused| kind|compression|linear|reversed|chroma|alpha|video|709|float|depth|YUV|
///     +------+-----+-----------+------+--------+------+-----+-----+---+-----+-----+---+
///
///     PixelFormatProperties properties = LookupPropertiesForName(MakePixelFormatName('b', 'g', 'r', 'a'));
///     properties.IsYUV();                                    // false
///     properties.Alpha() == kPixelFormatAlpha_Straight;      // true
///     properties.SetAlpha(kPixelFormatAlpha_Premultiplied);
///     GuessNameForProperties(properties);                    // "bgrp"
///
/// Every 32-bit value is a legal one and is kept as it is, unassigned codes and unused bits included; comparison sees all
/// 32 bits.

#include "zoncore/Requirements.h"

#include <cstdint>

namespace zonmediatypes
{

// ---- Codes of the fields ---------------------------------------------------------------------------------------------

/// Bits per component; 6 and 7 are not assigned. Formats of 15 bits store 16.
enum PixelFormatBitDepth : std::uint32_t
{
	kPixelFormatBitDepth_8 = 0,
	kPixelFormatBitDepth_10 = 1,
	kPixelFormatBitDepth_15 = 2,
	kPixelFormatBitDepth_16 = 3,
	kPixelFormatBitDepth_24 = 4,
	kPixelFormatBitDepth_32 = 5,
};

/// What the fourth component carries; codes above 3 occupy the component and mean nothing.
enum PixelFormatAlpha : std::uint32_t
{
	kPixelFormatAlpha_None = 0,            ///< there is no fourth component
	kPixelFormatAlpha_Straight = 1,        ///< "A"
	kPixelFormatAlpha_Premultiplied = 2,   ///< "P": colour components are multiplied by it
	kPixelFormatAlpha_Ignored = 3,         ///< "X": the component is there and its content is not looked at
};

/// How chroma is sampled and laid out.
enum PixelFormatSubsampling : std::uint32_t
{
	kPixelFormatSubsampling_444 = 0,   ///< every pixel has its own
	kPixelFormatSubsampling_422 = 1,   ///< packed, shared by two pixels of a row
	kPixelFormatSubsampling_DV = 2,    ///< as the DV variant has it
	kPixelFormatSubsampling_420 = 3,   ///< planar, shared by two pixels of two rows
};

/// How frames are coded; 13 and 14 are not assigned.
enum PixelFormatCompression : std::uint32_t
{
	kPixelFormatCompression_None = 0,
	kPixelFormatCompression_NTSCDV25 = 1,
	kPixelFormatCompression_PALDV25 = 2,
	kPixelFormatCompression_NTSCDV100_720p = 3,
	kPixelFormatCompression_PALDV100_720p = 4,
	kPixelFormatCompression_NTSCDV100_1080i = 5,
	kPixelFormatCompression_PALDV100_1080i = 6,
	kPixelFormatCompression_NTSCDV50 = 7,
	kPixelFormatCompression_PALDV50 = 8,
	kPixelFormatCompression_MPEG2Field = 9,
	kPixelFormatCompression_MPEG2Frame = 10,
	kPixelFormatCompression_MPEG4Field = 11,
	kPixelFormatCompression_MPEG4Frame = 12,
	kPixelFormatCompression_Unknown = 15,   ///< marks the invalid value and the wildcard
};

/// What the value stands for; 3 is not assigned.
enum PixelFormatKind : std::uint32_t
{
	kPixelFormatKind_Invalid = 0,
	kPixelFormatKind_Concrete = 1,
	kPixelFormatKind_Any = 2,   ///< the wildcard
};

// ---- The value -------------------------------------------------------------------------------------------------------

/// The properties of a pixel format. Getters are named after their fields; a setter keeps the low bits that its field has
/// room for.
class PixelFormatProperties
{
public:
	/// kPixelFormatProperties_Invalid.
	constexpr PixelFormatProperties() noexcept = default;
	/// All 32 bits as they are.
	explicit constexpr PixelFormatProperties(std::uint32_t inValue) noexcept : mValue(inValue) {}

	constexpr std::uint32_t GetValue() const noexcept { return mValue; }

	constexpr bool IsYUV() const noexcept { return Get(kIsYUV) != 0; }        ///< else RGB
	constexpr unsigned BitDepth() const noexcept { return Get(kBitDepth); }   ///< a PixelFormatBitDepth
	constexpr bool IsFloat() const noexcept { return Get(kIsFloat) != 0; }    ///< else unsigned integers
	constexpr bool Is709() const noexcept { return Get(kIs709) != 0; }   ///< of YUV: Rec. 709 matrix, else Rec. 601
	constexpr bool IsVideoRange() const noexcept { return Get(kIsVideoRange) != 0; }   ///< of YUV: else full range
	constexpr unsigned Alpha() const noexcept { return Get(kAlpha); }                  ///< a PixelFormatAlpha
	constexpr unsigned Subsampling() const noexcept { return Get(kSubsampling); }      ///< a PixelFormatSubsampling
	/// ARGB, YUYV; else BGRA, UYVY.
	constexpr bool ReversedOrder() const noexcept { return Get(kReversedOrder) != 0; }
	constexpr bool IsLinear() const noexcept { return Get(kIsLinear) != 0; }        ///< linear light
	constexpr unsigned Compression() const noexcept { return Get(kCompression); }   ///< a PixelFormatCompression
	constexpr unsigned Kind() const noexcept { return Get(kKind); }                 ///< a PixelFormatKind

	constexpr void SetIsYUV(bool inValue) noexcept { Set(kIsYUV, inValue); }
	constexpr void SetBitDepth(unsigned inCode) noexcept { Set(kBitDepth, inCode); }
	constexpr void SetIsFloat(bool inValue) noexcept { Set(kIsFloat, inValue); }
	constexpr void SetIs709(bool inValue) noexcept { Set(kIs709, inValue); }
	constexpr void SetIsVideoRange(bool inValue) noexcept { Set(kIsVideoRange, inValue); }
	constexpr void SetAlpha(unsigned inCode) noexcept { Set(kAlpha, inCode); }
	constexpr void SetSubsampling(unsigned inCode) noexcept { Set(kSubsampling, inCode); }
	constexpr void SetReversedOrder(bool inValue) noexcept { Set(kReversedOrder, inValue); }
	constexpr void SetIsLinear(bool inValue) noexcept { Set(kIsLinear, inValue); }
	constexpr void SetCompression(unsigned inCode) noexcept { Set(kCompression, inCode); }
	constexpr void SetKind(unsigned inCode) noexcept { Set(kKind, inCode); }

	/// Neither invalid nor a wildcard; the unassigned kind 3 is not concrete either.
	constexpr bool IsConcrete() const noexcept { return Kind() == kPixelFormatKind_Concrete; }
	constexpr bool IsCompressed() const noexcept { return Compression() != kPixelFormatCompression_None; }
	constexpr bool HasUnknownCompression() const noexcept { return Compression() == kPixelFormatCompression_Unknown; }
	/// DV and MPEG look at the compression code alone, whatever the kind.
	constexpr bool IsDV() const noexcept
	{
		return IsIn(kPixelFormatCompression_NTSCDV25, Compression(), kPixelFormatCompression_PALDV50);
	}
	constexpr bool IsMPEG() const noexcept
	{
		return IsIn(kPixelFormatCompression_MPEG2Field, Compression(), kPixelFormatCompression_MPEG4Frame);
	}
	/// Concrete, with chroma for every pixel and a fourth component, whatever that carries.
	constexpr bool Is4444() const noexcept
	{
		return IsConcrete() && Subsampling() == kPixelFormatSubsampling_444 && Alpha() != kPixelFormatAlpha_None;
	}
	/// The fourth component is an alpha channel, straight or premultiplied.
	constexpr bool HasAlpha() const noexcept
	{
		return IsIn(kPixelFormatAlpha_Straight, Alpha(), kPixelFormatAlpha_Premultiplied);
	}

	friend constexpr bool operator==(PixelFormatProperties, PixelFormatProperties) noexcept = default;

private:
	struct Field
	{
		unsigned mShift;   // of the lowest bit
		unsigned mBits;

		constexpr std::uint32_t Mask() const { return (1u << mBits) - 1; }
	};

	// The layout, from the lowest bit up.
	static constexpr Field kIsYUV{0, 1};
	static constexpr Field kBitDepth{1, 3};
	static constexpr Field kIsFloat{4, 1};
	static constexpr Field kIs709{5, 1};
	static constexpr Field kIsVideoRange{6, 1};
	static constexpr Field kAlpha{7, 3};
	static constexpr Field kSubsampling{10, 2};
	static constexpr Field kReversedOrder{12, 1};
	static constexpr Field kIsLinear{13, 1};
	static constexpr Field kCompression{14, 4};
	static constexpr Field kKind{18, 2};

	constexpr std::uint32_t Get(Field inField) const noexcept { return mValue >> inField.mShift & inField.Mask(); }
	constexpr void Set(Field inField, std::uint32_t inCode) noexcept
	{
		mValue = (mValue & ~(inField.Mask() << inField.mShift)) | (inCode & inField.Mask()) << inField.mShift;
	}
	static constexpr bool IsIn(unsigned inFirst, unsigned inCode, unsigned inLast) noexcept
	{
		return inCode - inFirst <= inLast - inFirst;
	}

	std::uint32_t mValue = std::uint32_t{kPixelFormatCompression_Unknown} << kCompression.mShift;
};

// ---- Constants -------------------------------------------------------------------------------------------------------

/// No format at all: 0x3C000.
inline constexpr PixelFormatProperties kPixelFormatProperties_Invalid;

/// The wildcard, any format: 0xBC000.
inline constexpr PixelFormatProperties kPixelFormatProperties_Any = []
{
	PixelFormatProperties properties;
	properties.SetKind(kPixelFormatKind_Any);
	return properties;
}();

}   // namespace zonmediatypes
