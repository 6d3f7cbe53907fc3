#include "host/LumvexArgs.h"

namespace {
constexpr const ACHAR *kMissing = L"\nMissing parametrs\n";
constexpr const ACHAR *kWrongType = L"\nArgument should be an short";

void CopyCut(const ACHAR *text, LumvexText out) {
  if (!out.buffer || out.capacity == 0) return;
  size_t i = 0;
  for (; text && text[i] && i + 1 < out.capacity; ++i) out.buffer[i] = text[i];
  out.buffer[i] = 0;
}

bool Report(const ACHAR *message) {
  acutPrintf(message);
  acedAlert(message);
  return false;
}
}  // namespace

bool ReadLumvexArgs(int &a, int &b, LumvexText s1, LumvexText s2, LumvexText s3) {
  resbuf *args = acedGetArgs();
  if (!args) return Report(kMissing);

  if (args->restype != RTSHORT) {
    Report(kWrongType);
    acutRelRb(args);
    return false;
  }

  const resbuf *second = args->rbnext;
  const resbuf *third = second ? second->rbnext : nullptr;
  const resbuf *fourth = third ? third->rbnext : nullptr;
  const resbuf *fifth = fourth ? fourth->rbnext : nullptr;
  if (!fifth) {
    Report(kMissing);
    acutRelRb(args);
    return false;
  }

  if (second->restype != RTSHORT || third->restype != RTSTR || fourth->restype != RTSTR || fifth->restype != RTSTR) {
    acutRelRb(args);
    acedAlert(kWrongType);
    acutPrintf(kWrongType);
    return false;
  }

  a = args->resval.rint;
  b = second->resval.rint;
  CopyCut(third->resval.rstring, s1);
  CopyCut(fourth->resval.rstring, s2);
  CopyCut(fifth->resval.rstring, s3);
  acutRelRb(args);
  return true;
}
