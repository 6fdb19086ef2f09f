#pragma once

#include "zonmediatypes/PixelFormatUtils.h"

#include <cstdint>
#include <fstream>
#include <iomanip>
#include <sstream>
#include <string>
#include <vector>

namespace zonmediatypes
{

/// A row of the published table of formats (data/pixel-formats.tsv).
struct PixelFormatRow
{
	std::string mConstant;
	std::string mCode;
	std::uint32_t mName;
	std::uint32_t mProperties;
};

inline std::vector<PixelFormatRow> ReadPixelFormatTable()
{
	std::ifstream file(ZON_TEST_DATA "/pixel-formats.tsv");
	std::vector<PixelFormatRow> rows;
	std::string line;
	std::getline(file, line);   // the headings
	while (std::getline(file, line))
	{
		std::istringstream fields(line);
		std::size_t index = 0;
		PixelFormatRow row;
		fields >> index >> row.mConstant >> row.mCode >> std::setbase(0) >> row.mName >> row.mProperties;
		if (fields && index == rows.size())
			rows.push_back(row);
	}
	return rows;
}

/// The built-in formats with the invalid one and the wildcard.
inline std::vector<PixelFormat> EveryPixelFormat()
{
	std::vector<PixelFormat> formats(AllPixelFormatsBegin(), AllPixelFormatsEnd());
	formats.push_back(kPixelFormat_Invalid);
	formats.push_back(kPixelFormat_Any);
	return formats;
}

}   // namespace zonmediatypes
