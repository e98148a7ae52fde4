// Writes what is installed beside the program: the manual page and the completion, into two files.

#include "Failure.h"
#include "Files.h"
#include "Help.h"

#include <exception>
#include <iostream>

int main(int argc, char** argv)
{
    using namespace curvelab;
    try {
        if (argc != 3)
            throw Failure("texts MANUAL COMPLETION: two files to write");
        StagedFile manual(argv[1], ManualPage(Commands()));
        StagedFile completion(argv[2], BashCompletion(Commands()));
        manual.Commit();
        completion.Commit();
        return 0;
    } catch (const std::exception& error) {
        std::cerr << error.what() << '\n';
        return 2;
    }
}
