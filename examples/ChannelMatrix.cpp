// What feeds each channel when stereo is played on 5.1, and 5.1 in stereo.

#include "zoncore/StringUtils.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Descriptions.h"

#include <iostream>

using namespace zonmediatypes;
using zoncore::utility::UTF16to8;

namespace
{

std::string Name(const AudioChannelDescription& inChannel)
{
	return UTF16to8(AudioChannelLabelAbbreviationsUnlocalized(inChannel.mLabel));
}

void ShowMatrix(const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination)
{
	std::cout << UTF16to8(AudioChannelLayoutDescription(inSource)) << " into "
			  << UTF16to8(AudioChannelLayoutDescription(inDestination)) << ":\n";
	ChannelConversionMatrix matrix;
	ComputeChannelConversionMatrix(inSource, inDestination, matrix);
	for (std::size_t row = 0; row < matrix.size(); ++row)
	{
		std::cout << "  " << Name(inDestination[row]) << " <-";
		for (std::size_t column = 0; column < inSource.size(); ++column)
		{
			if (matrix[row][column] != 0.0)
				std::cout << ' ' << matrix[row][column] << ' ' << Name(inSource[column]);
		}
		std::cout << '\n';
	}
}

}   // namespace

int main()
{
	ShowMatrix(CreateStereoChannelLayout(), CreateBroadcast51ChannelLayout());
	ShowMatrix(CreateBroadcast51ChannelLayout(), CreateStereoChannelLayout());
	ShowMatrix(CreateMonoChannelLayout(), CreateStereoChannelLayout());
}
