#include "explorer/MdiMixin.h"

bool CMdiMixin::SetFrameResource(UINT resourceId) {
  m_nFrameResource = resourceId;
  return true;
}
