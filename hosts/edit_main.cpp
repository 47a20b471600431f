#include "edit/Edit.h"

int main(int argc, char** argv) {
    return orvela::runEdit(argc, argv);
}
