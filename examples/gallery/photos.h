#pragma once

#include <QStringList>

// The gallery's sample photos: painted once into the cache folder, so the slideshow has
// pictures on disk to show through the transient image provider. Returns their paths.
QStringList samplePhotos();
