#include "GUI/Controls/Artwork.h"

#include <QtGlobal>

void initArtwork() {
    Q_INIT_RESOURCE(artwork);
}
