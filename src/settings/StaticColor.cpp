#include "settings/StaticColor.h"

#include "explorer/Handles.h"
#include "host/TextConvert.h"

void CStaticColor::SetColorIndex(int index) {
  m_colorIndex = index;
  m_rgb = acedGetRGB(index);
}

bool CStaticColor::GetLayerColor(const std::string &layer, AcCmColor &color) {
  AcDbHostApplicationServices *services = acdbHostApplicationServices();
  AcDbDatabase *database = services ? services->workingDatabase() : nullptr;
  AcDbLayerTable *table = nullptr;
  if (!database || database->getSymbolTable(table, AcDb::kForRead) != Acad::eOk || !table) return false;
  AcDbObjectId id;
  const Acad::ErrorStatus found = table->getIdAt(ToWide(layer.c_str()).c_str(), id);
  table->close();
  if (found != Acad::eOk) return false;
  AcDbObject *object = nullptr;
  if (acdbOpenObject(object, id, AcDb::kForRead) != Acad::eOk || !object) return false;
  AcDbLayerTableRecord *record = AcDbLayerTableRecord::cast(object);
  if (record) color = record->color();
  object->close();
  return record != nullptr;
}

void CStaticColor::SetColorFromLayer(const std::string &layer) {
  AcCmColor color;
  if (GetLayerColor(layer, color)) SetColorIndex(color.colorIndex());
}

void CStaticColor::FillClient(HDC dc) const {
  RECT client;
  GetClientRect(&client);
  const BrushHandle brush(CreateSolidBrush(m_rgb));
  FillRect(dc, &client, brush.Get());
}

void CStaticColor::ChooseColor() {
  if (!acedSetColorDialog(m_colorIndex, false, 0)) return;
  m_bChosen = true;
  m_rgb = acedGetRGB(m_colorIndex);
  RedrawWindow(m_hWnd, nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
}

BOOL CStaticColor::OnChildNotify(UINT message, WPARAM wParam, LPARAM, LRESULT *result) {
  if (message == WM_CTLCOLORSTATIC) {
    FillClient(reinterpret_cast<HDC>(wParam));
    *result = 0;
    return TRUE;
  }
  if (message == WM_COMMAND && HIWORD(wParam) == STN_CLICKED) {
    ChooseColor();
    *result = 0;
    return TRUE;
  }
  return FALSE;
}

LRESULT CStaticColor::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    // Reached with Tab like a button (a plain static is passed over), and Space opens the
    // colour dialog as a click does.
    case WM_GETDLGCODE: return DLGC_WANTCHARS;
    case WM_CHAR:
      if (wParam == ' ') ChooseColor();
      return 0;
    case WM_SETFOCUS:
    case WM_KILLFOCUS: ::InvalidateRect(m_hWnd, nullptr, TRUE); return 0;
    default: break;
  }
  if (message == WM_PAINT) {
    // A white-rectangle static paints white over whatever its colour handling drew: the swatch
    // paints itself through that handling alone.
    PAINTSTRUCT paint;
    HDC dc = BeginPaint(m_hWnd, &paint);
    LRESULT ignored = 0;
    OnChildNotify(WM_CTLCOLORSTATIC, reinterpret_cast<WPARAM>(dc), reinterpret_cast<LPARAM>(m_hWnd), &ignored);
    if (::GetFocus() == m_hWnd) {
      RECT inside;
      ::GetClientRect(m_hWnd, &inside);
      InflateRect(&inside, -2, -2);
      DrawFocusRect(dc, &inside);
    }
    EndPaint(m_hWnd, &paint);
    return 0;
  }
  return CStatic::WindowProc(message, wParam, lParam);
}
