#include "command/Command.h"

int main(int argc, char** argv) {
    return orvela::runCommand(argc, argv);
}
