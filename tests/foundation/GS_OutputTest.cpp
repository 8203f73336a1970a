#include "foundation/graphicservice/GS_Output.h"

#include <gtest/gtest.h>

#include <sstream>

using namespace MoxGraphicService_NS;

namespace {

TEST(GS_Output, WritesBytes) {
    std::ostringstream stream;
    GS_Output output(stream);
    EXPECT_TRUE(output.write("a\0b", 3));
    EXPECT_TRUE(output.flush());
    EXPECT_EQ(stream.str(), std::string("a\0b", 3));
}

TEST(GS_Output, RefusalIsToldAndNotThrown) {
    std::ostream stream(nullptr);
    GS_Output output(stream);
    EXPECT_FALSE(output.write("a", 1));
    EXPECT_FALSE(output.flush());
}

TEST(GS_Output, ExceptionsOfTheStreamStayInside) {
    std::ostream stream(nullptr);
    stream.clear();
    GS_Output output(stream);
    try {
        stream.exceptions(std::ios::badbit);
    } catch (const std::ios::failure&) { // thrown for the state that it has already
    }
    EXPECT_FALSE(output.write("a", 1));
    EXPECT_FALSE(output.flush());
}

} // namespace
