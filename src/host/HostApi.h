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

// The drawing database, as far as the layer lookups go: the working database's layer table,
// a layer's record and its colour. Objects are opened for reading and closed by the caller.
namespace Acad {
enum ErrorStatus : int { eOk = 0, eKeyNotFound = 81, eNotThatKindOfClass = 120, eNullObjectId = 5 };
}
namespace AcDb {
enum OpenMode : int { kForRead = 0, kForWrite = 1, kForNotify = 2 };
}

class AcDbObjectId {
 public:
  AcDbObjectId() = default;
  explicit AcDbObjectId(const void *stub) : m_stub(stub) {}
  bool isNull() const { return m_stub == nullptr; }
  const void *stub() const { return m_stub; }

 private:
  const void *m_stub = nullptr;
};

class AcCmColor {
 public:
  explicit AcCmColor(short index = 256) : m_index(index) {}
  short colorIndex() const { return m_index; }

 private:
  short m_index;
};

class AcDbObject : public AcRxObject {
 public:
  virtual Acad::ErrorStatus close() = 0;
};

class AcDbLayerTableRecord : public AcDbObject {
 public:
  static constexpr const ACHAR *kClassName = L"AcDbLayerTableRecord";
  virtual AcCmColor color() const = 0;
  static AcDbLayerTableRecord *cast(AcRxObject *object) {
    return IsNamed(object, kClassName) ? static_cast<AcDbLayerTableRecord *>(object) : nullptr;
  }

 private:
  static bool IsNamed(const AcRxObject *object, const ACHAR *expected) {
    if (!object) return false;
    const ACHAR *name = object->className();
    while (*name && *name == *expected) ++name, ++expected;
    return *name == *expected;
  }
};

class AcDbLayerTable : public AcDbObject {
 public:
  virtual Acad::ErrorStatus getIdAt(const ACHAR *name, AcDbObjectId &id, bool getErased = false) const = 0;
};

class AcDbDatabase {
 public:
  virtual ~AcDbDatabase() = default;
  virtual Acad::ErrorStatus getSymbolTable(AcDbLayerTable *&table, AcDb::OpenMode mode) = 0;
};

class AcDbHostApplicationServices {
 public:
  virtual ~AcDbHostApplicationServices() = default;
  virtual AcDbDatabase *workingDatabase() const = 0;
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

// Colours: the host's index colours (ACI 1 to 255) and its colour dialog. acedGetRGB gives the
// colour as a Windows colour value (red in the low byte); acedSetColorDialog shows the dialog on
// `color` and, when the user accepts, writes the chosen index back and returns true.
LUMVEX_HOST_DECL uint32_t acedGetRGB(int color);
LUMVEX_HOST_DECL bool acedSetColorDialog(int &color, bool allowMetaColor, int currentLayerColor);

// The drawing database.
LUMVEX_HOST_DECL AcDbHostApplicationServices *acdbHostApplicationServices();
// Opens the object of `id`; the caller closes it.
LUMVEX_HOST_DECL Acad::ErrorStatus acdbOpenObject(AcDbObject *&object, AcDbObjectId id, AcDb::OpenMode mode);

// Drawing previews.
LUMVEX_HOST_DECL bool acdbDisplayPreviewFromDwg(const ACHAR *path, void *window, const uint32_t *background);
}
