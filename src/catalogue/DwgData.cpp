#include "catalogue/DwgData.h"

namespace {
DwgCatalogue theCatalogue;
}

DwgCatalogue *const g_pCatalogue = &theCatalogue;
