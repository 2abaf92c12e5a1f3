// tvxcim: a CIM client that runs the embedded broker in-process on a
// provider registration and answers one request.
#include <iostream>

#include "tvxcim/Tvxcim.h"

int main(int argc, char **argv) {
    return tvxcim::runTvxcim(std::vector<std::string>(argv + 1, argv + argc), std::cout, std::cerr);
}
