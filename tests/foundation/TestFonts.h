/// The fonts that tests find in the system, whatever is installed on the machine.
#pragma once

#include "foundation/fontservice/FS_FontInfo.h"

#include <string>

namespace DrawmereTest {

/// Returns: the path of a file in tests/data/fonts.
std::string fontFile(const std::string& name);

/// Returns: the bytes of a file in tests/data/fonts.
std::string fontBytes(const std::string& name);

/// Returns: a configuration of fontconfig with the fonts of `folder`; `rules` goes into it.
std::string fontConfiguration(const std::string& folder, const std::string& cacheFolder,
                              const std::string& rules);

/// Sets an environment variable and sets it back.
class SetVariable {
public:
    SetVariable(std::string name, const std::string& value);
    SetVariable(const SetVariable&) = delete;
    SetVariable& operator=(const SetVariable&) = delete;
    ~SetVariable();

private:
    std::string variable;
    bool wasSet;
    std::string before;
};

/// Returns: the polygons of a glyph in the form "M0,0 L1,0 Q1,1 0,1 Z", advances left out;
/// "unreadable" for a glyph that can't be read.
std::string outlineOf(const MoxFontService_NS::FS_FontInfo& font, unsigned short glyphId);

} // namespace DrawmereTest
