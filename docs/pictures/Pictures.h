#pragma once

namespace pictures
{

/// Each writes one picture to standard output.
void DrawCadences();
void DrawChannelGrid();
void DrawConversionCosts();
void DrawDropFrame();

}   // namespace pictures
