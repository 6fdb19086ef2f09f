// Draws the pictures of the guides from the library's own tables and functions: MakePictures NAME writes one as SVG.

#include "Pictures.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <iostream>
#include <string_view>

namespace
{

struct NamedPicture
{
	std::string_view mName;
	void (*mDraw)();
};

constexpr auto sPictures = std::to_array<NamedPicture>({
	{"cadences", pictures::DrawCadences},
	{"channel-grid", pictures::DrawChannelGrid},
	{"conversion-costs", pictures::DrawConversionCosts},
	{"drop-frame", pictures::DrawDropFrame},
});

}   // namespace

int main(int inCount, char** inArguments)
{
	const std::string_view name = inCount == 2 ? inArguments[1] : "";
	const auto picture = std::ranges::find(sPictures, name, &NamedPicture::mName);
	if (picture == sPictures.end())
	{
		std::cerr << "usage: MakePictures NAME\n";
		return EXIT_FAILURE;
	}
	picture->mDraw();
	return EXIT_SUCCESS;
}
