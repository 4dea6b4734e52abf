#include "support/SamplePhotographs.h"

#include <cstdio>
#include <cstdlib>

// photographs FOLDER COUNT
int main(int argc, char** argv) {
    if (argc != 3)
        return 2;
    const auto paths = lumora::writeSamplePhotographs(argv[1], std::atoi(argv[2]));
    if (!paths)
        std::fprintf(stderr, "%s\n", qPrintable(paths.failure().message));
    return paths ? 0 : 1;
}
