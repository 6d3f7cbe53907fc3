// The host seam: every operation the module asks of the CAD application, declared by the
// names the host uses. In this tree they are exported by the development host's runtime DLL;
// against the CAD application's SDK this header is the one file that changes.
#pragma once

#include <cstdint>

typedef wchar_t ACHAR;
typedef double ads_real;
typedef ads_real ads_point[3];
typedef int64_t ads_name[2];
typedef int ads_int;

// Result-buffer type codes.
enum : short {
  RTNONE = 5000,
  RTREAL = 5001,
  RTPOINT = 5002,
  RTSHORT = 5003,
  RTANG = 5004,
  RTSTR = 5005,
  RTENAME = 5006,
  RTPICKS = 5007,
  RTORINT = 5008,
  RT3DPOINT = 5009,
  RTLONG = 5010,
  RTVOID = 5014,
  RTLB = 5016,
  RTLE = 5017,
  RTDOTE = 5018,
  RTNIL = 5019,
  RTDXF0 = 5020,
  RTT = 5021,
};

// Status codes.
enum : int {
  RTNORM = 5100,
  RTERROR = -5001,
  RTCAN = -5002,
};

// Entry-point messages and results.
enum AcRxAppMsgCode : int {
  kNullMsg = 0,
  kInitAppMsg = 1,
  kUnloadAppMsg = 2,
  kLoadDwgMsg = 3,
  kUnloadDwgMsg = 4,
  kInvkSubrMsg = 5,
  kCfgMsg = 6,
  kEndMsg = 7,
  kQuitMsg = 8,
  kSaveMsg = 9,
};

enum AcRxAppRetCode : int { kRetOK = 0, kRetError = 3 };

struct resbuf {
  resbuf *rbnext;
  short restype;
  union ads_u_val {
    ads_real rreal;
    ads_real rpoint[3];
    short rint;
    ACHAR *rstring;
    int64_t rlname[2];
    int32_t rlong;
    int64_t mnInt64;
  } resval;
};

// Host object model: only the operations the module uses.
class AcRxObject {
 public:
  virtual ~AcRxObject() = default;
  virtual const ACHAR *className() const = 0;
};

class AcRxDictionary : public AcRxObject {
 public:
  virtual AcRxObject *at(const ACHAR *key) const = 0;
};

class AcRxDynamicLinker : public AcRxObject {
 public:
  static constexpr const ACHAR *kClassName = L"AcRxDynamicLinker";
  virtual bool unlockApplication(void *appId) const = 0;
  virtual bool registerAppMDIAware(void *appId) const = 0;
  // The host's checked down-cast: the object itself when it is a dynamic linker, else null.
  static AcRxDynamicLinker *cast(AcRxObject *object) {
    if (!object) return nullptr;
    const ACHAR *name = object->className();
    const ACHAR *expected = kClassName;
    while (*name && *name == *expected) ++name, ++expected;
    return *name == *expected ? static_cast<AcRxDynamicLinker *>(object) : nullptr;
  }
};

class AcApDocument;

class AcApDocManagerReactor {
 public:
  virtual ~AcApDocManagerReactor() = default;
  virtual void documentCreated(AcApDocument *) {}
  virtual void documentToBeDestroyed(AcApDocument *) {}
};

class AcApDocManager {
 public:
  virtual ~AcApDocManager() = default;
  virtual void addReactor(AcApDocManagerReactor *reactor) = 0;
  virtual void removeReactor(AcApDocManagerReactor *reactor) = 0;
};

// The host's application object: its main window owns the shell calls' dialogs.
class CWinAppHost {
 public:
  virtual ~CWinAppHost() = default;
  virtual void *mainWindow() const = 0;
};

#ifdef _WIN32
#define LUMVEX_HOST_API __declspec(dllimport)
#else
#define LUMVEX_HOST_API
#endif

#ifndef LUMVEX_HOST_EXPORT
#define LUMVEX_HOST_DECL LUMVEX_HOST_API
#else
#define LUMVEX_HOST_DECL LUMVEX_HOST_EXPORT
#endif

extern "C" {
// Module.
LUMVEX_HOST_DECL AcRxDictionary *acrxSysRegistry();
LUMVEX_HOST_DECL AcApDocManager *acDocManagerPtr();

// AutoLISP.
LUMVEX_HOST_DECL int acedDefun(const ACHAR *name, int funcNumber);
LUMVEX_HOST_DECL int acedUndef(const ACHAR *name, int funcNumber);
LUMVEX_HOST_DECL int acedGetFunCode();
LUMVEX_HOST_DECL resbuf *acedGetArgs();
LUMVEX_HOST_DECL int acedRetVoid();
LUMVEX_HOST_DECL int acedRetNil();
LUMVEX_HOST_DECL int acedRetList(const resbuf *chain);

// Result buffers.
LUMVEX_HOST_DECL resbuf *acutNewRb(int type);
LUMVEX_HOST_DECL resbuf *acutBuildList(int type, ...);
LUMVEX_HOST_DECL int acutRelRb(resbuf *chain);
// A copy of the text that acutRelRb can release with the node holding it; null when out of memory.
LUMVEX_HOST_DECL ACHAR *acad__strdup(const ACHAR *text);

// Messages.
LUMVEX_HOST_DECL int acutPrintf(const ACHAR *format, ...);
LUMVEX_HOST_DECL int acedAlert(const ACHAR *text);
LUMVEX_HOST_DECL void acdbFail(const ACHAR *message);

// Windows of the host (HWND and the application object, as opaque pointers here).
LUMVEX_HOST_DECL void *acedGetAcadFrame();
LUMVEX_HOST_DECL CWinAppHost *acedGetAcadWinApp();
LUMVEX_HOST_DECL void *acedGetAcadDwgView();

// Drawing previews.
LUMVEX_HOST_DECL bool acdbDisplayPreviewFromDwg(const ACHAR *path, void *window, const uint32_t *background);
}
