// The main program of the small examples.
#include "picture/Svg.h"

#include <exception>

int main(int argumentCount, char** arguments)
try {
    if (argumentCount != 2) {
        std::fprintf(stderr, "usage: %s PICTURE.svg\n", arguments[0]);
        return 2;
    }
    Draw(arguments[1]);
    return 0;

} catch (const std::exception& trouble) {
    std::fprintf(stderr, "%s: %s\n", arguments[0], trouble.what());
    return 1;
}
