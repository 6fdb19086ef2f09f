#pragma once

/// \file
/// The little of SVG that the pictures need: boxes, lines and text on a light page, written to standard output.

#include <iostream>
#include <string>
#include <string_view>

namespace pictures
{

/// Names of the classes in the style sheet below; together they are the palette of all pictures.
inline constexpr std::string_view kStyle = R"(<style>
text { font-family: "DejaVu Sans", Verdana, sans-serif; font-size: 13px; fill: #1f2933; text-anchor: middle }
.title { font-size: 15px; font-weight: bold; text-anchor: start }
.note { font-size: 12px; fill: #52606d }
.left { text-anchor: start }
.right { text-anchor: end }
.mono { font-family: "DejaVu Sans Mono", Consolas, monospace }
.label { font-size: 12px }
.dropped { font-size: 12px; fill: #b3382c; text-decoration: line-through }
.page { fill: #ffffff }
.grid { stroke: #e1e6eb; stroke-width: 1 }
.axis { stroke: #cbd2d9; stroke-width: 1.5 }
.frame { fill: #e3effa; stroke: #2f6ea5; stroke-width: 1.2 }
.kept { fill: #e3f4e6; stroke: #2f8546; stroke-width: 1.2 }
.ghost { fill: #fdf1ef; stroke: #b3382c; stroke-width: 1.2; stroke-dasharray: 4 3 }
.marked { fill: #fff1cc; stroke: #a8720a; stroke-width: 1.8 }
.listener, .none { fill: #f0f3f6; stroke: #cbd2d9; stroke-width: 1.2 }
</style>
)";

class Picture
{
public:
	/// Begins a picture of the given size; inDescription is read out to people who cannot see it.
	Picture(int inWidth, int inHeight, std::string_view inDescription)
	{
		std::cout << "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"" << inWidth << "\" height=\"" << inHeight
				  << "\" viewBox=\"0 0 " << inWidth << ' ' << inHeight << "\" role=\"img\">\n<title>" << inDescription
				  << "</title>\n"
				  << kStyle << "<rect class=\"page\" width=\"" << inWidth << "\" height=\"" << inHeight << "\"/>\n";
	}
	~Picture() { std::cout << "</svg>\n"; }
	Picture(const Picture&) = delete;
	Picture& operator=(const Picture&) = delete;

	void Box(std::string_view inClass, int inLeft, int inTop, int inWidth, int inHeight) const
	{
		std::cout << "<rect class=\"" << inClass << "\" x=\"" << inLeft << "\" y=\"" << inTop << "\" width=\""
				  << inWidth << "\" height=\"" << inHeight << "\" rx=\"4\"/>\n";
	}
	void Line(std::string_view inClass, int inX1, int inY1, int inX2, int inY2) const
	{
		std::cout << "<line class=\"" << inClass << "\" x1=\"" << inX1 << "\" y1=\"" << inY1 << "\" x2=\"" << inX2
				  << "\" y2=\"" << inY2 << "\"/>\n";
	}
	void Circle(std::string_view inClass, int inX, int inY, int inRadius) const
	{
		std::cout << "<circle class=\"" << inClass << "\" cx=\"" << inX << "\" cy=\"" << inY << "\" r=\"" << inRadius
				  << "\"/>\n";
	}
	/// Centred on inX unless the class says otherwise; inY is the base line.
	void Text(std::string_view inClass, int inX, int inY, std::string_view inText) const
	{
		std::cout << "<text class=\"" << inClass << "\" x=\"" << inX << "\" y=\"" << inY << "\">" << inText
				  << "</text>\n";
	}
};

}   // namespace pictures
