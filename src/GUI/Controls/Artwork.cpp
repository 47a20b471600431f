#include "GUI/Controls/Artwork.h"

#include <QtGlobal>

// The macro declares a function of the namespace that it stands in, and the resource's is in none.
static void initResource() {
    Q_INIT_RESOURCE(artwork);
}

void orvela::initArtwork() {
    initResource();
}
