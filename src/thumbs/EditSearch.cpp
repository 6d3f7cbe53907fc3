#include "thumbs/EditSearch.h"

CEditSearch *g_pSearchBox = nullptr;

CEditSearch::CEditSearch() { g_pSearchBox = this; }

CEditSearch::~CEditSearch() {
  if (g_pSearchBox == this) g_pSearchBox = nullptr;
}
