#pragma once

namespace pictures
{

/// Each writes one picture to standard output.
void DrawChannelGrid();
void DrawDropFrame();
void DrawCadences();

}   // namespace pictures
