// Where the labels stand around the listener: the three layers of the grid, seen from above.

#include "Pictures.h"
#include "Svg.h"
#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"

#include <algorithm>
#include <array>
#include <vector>

namespace pictures
{
namespace
{

using namespace zonmediatypes;

constexpr int kSpacing = 66;   // pixels between grid points
constexpr int kPanelWidth = 350;
constexpr int kTop = 78;
constexpr int kExtent = 2;   // the grid runs from -2 to 2

struct Layer
{
	std::string_view mTitle;
	int mY;
};
constexpr auto sLayers = std::to_array<Layer>({{"below", -2}, {"at ear level", 0}, {"above", 2}});

int PanelCentre(int inPanel)
{
	return inPanel * kPanelWidth + kPanelWidth / 2;
}
int Column(int inPanel, int inX)
{
	return PanelCentre(inPanel) + inX * kSpacing;
}
int Row(int inZ)
{
	return kTop + (kExtent - inZ) * kSpacing;
}

// LFE, LFE2 and Discrete share the origin with W, but take no part in distances.
bool HasPlace(const AudioChannelLabelRow& inRow)
{
	return inRow.mLabel != kAudioChannelLabel_Discrete && inRow.mLabel != kAudioChannelLabel_LowFrequency
		&& inRow.mLabel != kAudioChannelLabel_LFE2;
}

std::vector<std::string_view> LabelsAt(int inX, int inY, int inZ)
{
	std::vector<std::string_view> labels;
	for (const AudioChannelLabelRow& row : kAudioChannelLabels)
	{
		if (HasPlace(row) && row.mPosition.mX == inX && row.mPosition.mY == inY && row.mPosition.mZ == inZ)
			labels.push_back(row.mAbbreviation);
	}
	return labels;
}

void DrawGrid(const Picture& inPicture, int inPanel)
{
	for (int line = -kExtent; line <= kExtent; ++line)
	{
		inPicture.Line("grid", Column(inPanel, -kExtent), Row(line), Column(inPanel, kExtent), Row(line));
		inPicture.Line("grid", Column(inPanel, line), Row(kExtent), Column(inPanel, line), Row(-kExtent));
	}
	inPicture.Circle("listener", Column(inPanel, 0), Row(0), 27);
}

void DrawLabels(const Picture& inPicture, int inX, int inMiddle, const std::vector<std::string_view>& inLabels)
{
	constexpr int kLineHeight = 16;
	const int count = static_cast<int>(inLabels.size());
	const int height = count * kLineHeight + 8;
	inPicture.Box("frame", inX - 21, inMiddle - height / 2, 42, height);
	for (int line = 0; line < count; ++line)
		inPicture.Text(
			"", inX, inMiddle - height / 2 + 17 + line * kLineHeight, inLabels[static_cast<std::size_t>(line)]);
}

void DrawLayer(const Picture& inPicture, int inPanel, const Layer& inLayer)
{
	inPicture.Text("title", Column(inPanel, -kExtent) - 21, 26, inLayer.mTitle);
	inPicture.Text("note", PanelCentre(inPanel), kTop - 36, "front");
	inPicture.Text("note", PanelCentre(inPanel), Row(-kExtent) + 44, "back");
	DrawGrid(inPicture, inPanel);
	for (int z = -kExtent; z <= kExtent; ++z)
	{
		for (int x = -kExtent; x <= kExtent; ++x)
		{
			if (const auto labels = LabelsAt(x, inLayer.mY, z); !labels.empty())
				DrawLabels(inPicture, Column(inPanel, x), Row(z), labels);
		}
	}
}

}   // namespace

void DrawChannelGrid()
{
	constexpr int kWidth = kPanelWidth * static_cast<int>(sLayers.size());
	const Picture picture(kWidth, Row(-kExtent) + 86, "The places of the channel labels around the listener");
	for (std::size_t panel = 0; panel < sLayers.size(); ++panel)
		DrawLayer(picture, static_cast<int>(panel), sLayers[panel]);
	picture.Text("note", kWidth / 2, Row(-kExtent) + 72,
		"One step of the grid is a distance of 1; the layers are 2 apart. The circle is the listener. "
		"LFE, LFE2 and unlabelled channels have no place.");
}

}   // namespace pictures
