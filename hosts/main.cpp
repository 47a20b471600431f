#include "command/Command.h"

int main(int argc, char** argv) {
    return runCommand(argc, argv);
}
