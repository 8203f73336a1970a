#include <gmock/gmock.h>

#include <cstdlib>
#include <cstring>

/// Runs the tests of one folder. "--update-golden" stands for DRAWMERE_UPDATE_GOLDEN=1 in the
/// environment, the form that also reaches tests which ctest starts.
int main(int argc, char** argv) {
    testing::InitGoogleMock(&argc, argv);
    for (int i = 1; i < argc; ++i) {
        if (std::strcmp(argv[i], "--update-golden") == 0) {
            setenv("DRAWMERE_UPDATE_GOLDEN", "1", /*replace=*/1);
        }
    }
    return RUN_ALL_TESTS();
}
