#include "host/LumvexArgs.h"

namespace {
constexpr const ACHAR *kMissing = L"\nMissing parametrs\n";
constexpr const ACHAR *kWrongType = L"\nArgument should be an short";
constexpr short kSignature[] = {RTSHORT, RTSHORT, RTSTR, RTSTR, RTSTR};

void CopyCut(const ACHAR *text, LumvexText out) {
  if (!out.buffer || out.capacity == 0) return;
  size_t i = 0;
  for (; text && text[i] && i + 1 < out.capacity; ++i) out.buffer[i] = text[i];
  out.buffer[i] = 0;
}

// The first argument's wrong type is told in the order print, alert, release; a later one's
// in the order release, alert, print, as callers have always seen them.
bool ReportWrongType(size_t position, resbuf *args) {
  if (position == 0) {
    acutPrintf(kWrongType);
    acedAlert(kWrongType);
    acutRelRb(args);
  } else {
    acutRelRb(args);
    acedAlert(kWrongType);
    acutPrintf(kWrongType);
  }
  return false;
}

bool ReportMissing(resbuf *args) {
  acutPrintf(kMissing);
  acedAlert(kMissing);
  if (args) acutRelRb(args);
  return false;
}
}  // namespace

bool ReadLumvexArgs(int &a, int &b, LumvexText s1, LumvexText s2, LumvexText s3) {
  resbuf *args = acedGetArgs();
  // Argument by argument, present and then of its type: the first failing check decides.
  const resbuf *found[5] = {};
  const resbuf *node = args;
  for (size_t i = 0; i < 5; ++i, node = node->rbnext) {
    if (!node) return ReportMissing(args);
    if (node->restype != kSignature[i]) return ReportWrongType(i, args);
    found[i] = node;
  }

  a = found[0]->resval.rint;
  b = found[1]->resval.rint;
  CopyCut(found[2]->resval.rstring, s1);
  CopyCut(found[3]->resval.rstring, s2);
  CopyCut(found[4]->resval.rstring, s3);
  acutRelRb(args);
  return true;
}
