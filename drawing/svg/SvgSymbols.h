#pragma once

#include <string>

#include "region/model/Path.h"

namespace gmdrawing {

/// Upright text whose baseline starts at a point of the drawing, `size` drawing units high. The
/// font itself has a common size and is scaled: renderers hint and round fonts of a fraction of a
/// unit, as a drawing in inches would need, until they cannot be read. The text is not escaped.
std::string textTag(gmregion::Vec2 at, double size, const std::string& attributes,
                    const std::string& text);

/// A dot at the start of a path and an arrow head a little further along it, as SVG of the given
/// style class. Their size follows the diagonal of the whole picture, but stays small beside small
/// paths. Nothing for a path without elements.
std::string startMark(const gmregion::Path& path, const std::string& styleClass, double diagonal);

/// The path's number beside its start, inside of what a closed path encloses or outside of it;
/// right of the direction of travel where there is no inside. The text stands upright.
std::string numberLabel(const gmregion::Path& path, const std::string& number, bool inside,
                        double diagonal);

}  // namespace gmdrawing
