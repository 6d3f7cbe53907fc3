// The children button of a shell item before its children are known, from what its folder
// reports when asked: a shell reports only the attributes it is asked for.
#include "explorer/ShellAttributes.h"

#include <gtest/gtest.h>

namespace {
// A folder whose one item has `attributes`; it answers with those it is asked for.
class ReportingFolder : public IShellFolder {
 public:
  explicit ReportingFolder(ULONG attributes) : m_attributes(attributes) {}

  HRESULT STDMETHODCALLTYPE GetAttributesOf(UINT, LPCITEMIDLIST *, SFGAOF *wanted) override {
    *wanted &= m_attributes;
    return S_OK;
  }
  HRESULT STDMETHODCALLTYPE QueryInterface(REFIID, void **out) override { return *out = nullptr, E_NOINTERFACE; }
  ULONG STDMETHODCALLTYPE AddRef() override { return 1; }
  ULONG STDMETHODCALLTYPE Release() override { return 1; }
  HRESULT STDMETHODCALLTYPE ParseDisplayName(HWND, IBindCtx *, LPWSTR, ULONG *, LPITEMIDLIST *, ULONG *) override {
    return E_NOTIMPL;
  }
  HRESULT STDMETHODCALLTYPE EnumObjects(HWND, SHCONTF, IEnumIDList **) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE BindToObject(LPCITEMIDLIST, IBindCtx *, REFIID, void **) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE BindToStorage(LPCITEMIDLIST, IBindCtx *, REFIID, void **) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE CompareIDs(LPARAM, LPCITEMIDLIST, LPCITEMIDLIST) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE CreateViewObject(HWND, REFIID, void **) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE GetUIObjectOf(HWND, UINT, LPCITEMIDLIST *, REFIID, UINT *, void **) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE GetDisplayNameOf(LPCITEMIDLIST, SHGDNF, STRRET *) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE SetNameOf(HWND, LPCITEMIDLIST, LPCWSTR, SHGDNF, LPITEMIDLIST *) override { return E_NOTIMPL; }

 private:
  ULONG m_attributes;
};

TEST(ShellAttributes, ChildrenButtonFromWhatTheFolderReportsWhenAsked) {
  const struct {
    const char *name;
    ULONG attributes;
    bool listNonFolders;
    int button;
  } rows[] = {
      {"a folder with sub-folders", SFGAO_FOLDER | SFGAO_HASSUBFOLDER, false, 1},
      {"a folder without", SFGAO_FOLDER, false, 0},
      {"a folder on removable media, contents unknown", SFGAO_FOLDER | SFGAO_REMOVABLE, false, 1},
      {"a folder listed with its files", SFGAO_FOLDER, true, 1},
      {"not a folder", SFGAO_REMOVABLE | SFGAO_HASSUBFOLDER, true, 0},
  };
  SHITEMID item{sizeof(USHORT) + 1, {0}};
  const ITEMIDLIST child{item};
  for (const auto &row : rows) {
    ReportingFolder folder(row.attributes);
    EXPECT_EQ(ChildrenButton(&folder, &child, row.listNonFolders), row.button) << row.name;
  }
  EXPECT_EQ(ChildrenButton(nullptr, &child, false), 0) << "no folder to ask";
}
}  // namespace
