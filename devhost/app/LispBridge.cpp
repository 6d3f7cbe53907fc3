#include "app/LispBridge.h"

#include "runtime/TestApi.h"

#include <cstdint>
#include <cwchar>
#include <memory>

namespace {
struct ChainRelease {
  void operator()(resbuf *chain) const { acutRelRb(chain); }
};
using Chain = std::unique_ptr<resbuf, ChainRelease>;

bool IsNumber(const lisp::Value &value) { return value.kind == lisp::Value::Kind::Int || value.kind == lisp::Value::Kind::Real; }

double AsReal(const lisp::Value &value) { return value.kind == lisp::Value::Kind::Int ? value.integer : value.real; }

class ChainBuilder {
 public:
  ChainBuilder() = default;
  ChainBuilder(const ChainBuilder &) = delete;
  ChainBuilder &operator=(const ChainBuilder &) = delete;
  ~ChainBuilder() { acutRelRb(m_head); }

  void Add(const lisp::Value &value) {
    using Kind = lisp::Value::Kind;
    switch (value.kind) {
      case Kind::Nil:
      case Kind::Void: Append(acutBuildList(RTNIL, 0)); break;
      case Kind::T: Append(acutBuildList(RTT, 0)); break;
      case Kind::Int:
        if (value.integer >= INT16_MIN && value.integer <= INT16_MAX)
          Append(acutBuildList(RTSHORT, static_cast<int>(value.integer), 0));
        else
          Append(acutBuildList(RTLONG, value.integer, 0));
        break;
      case Kind::Real: Append(acutBuildList(RTREAL, value.real, 0)); break;
      case Kind::Str:
      case Kind::Sym: Append(acutBuildList(RTSTR, value.text.c_str(), 0)); break;
      case Kind::List: AddList(value.items); break;
    }
  }

  resbuf *Release() {
    resbuf *head = m_head;
    m_head = m_tail = nullptr;
    return head;
  }

 private:
  void AddList(const std::vector<lisp::Value> &items) {
    // A list of two or three numbers reaches a function as a point, as in the CAD application.
    const bool point = (items.size() == 2 || items.size() == 3) && IsNumber(items[0]) && IsNumber(items[1]) &&
                       (items.size() == 2 || IsNumber(items[2]));
    if (point) {
      double coordinates[3] = {AsReal(items[0]), AsReal(items[1]), items.size() == 3 ? AsReal(items[2]) : 0.0};
      Append(acutBuildList(items.size() == 3 ? RT3DPOINT : RTPOINT, coordinates, 0));
      return;
    }
    Append(acutBuildList(RTLB, 0));
    for (const lisp::Value &item : items) Add(item);
    Append(acutBuildList(RTLE, 0));
  }

  void Append(resbuf *node) {
    if (!node) return;
    (m_tail ? m_tail->rbnext : m_head) = node;
    m_tail = node;
  }

  resbuf *m_head = nullptr;
  resbuf *m_tail = nullptr;
};

lisp::Value ReadOne(const resbuf *&node);

lisp::Value ReadList(const resbuf *&node) {
  std::vector<lisp::Value> items;
  while (node && node->restype != RTLE && node->restype != RTDOTE) items.push_back(ReadOne(node));
  if (node) node = node->rbnext;
  return lisp::Value::List(std::move(items));
}

lisp::Value ReadOne(const resbuf *&node) {
  const resbuf *current = node;
  node = node->rbnext;
  switch (current->restype) {
    case RTLB: return ReadList(node);
    case RTSHORT: return lisp::Value::Int(current->resval.rint);
    case RTLONG: return lisp::Value::Int(current->resval.rlong);
    case RTREAL:
    case RTANG:
    case RTORINT: return lisp::Value::Real(current->resval.rreal);
    case RTSTR: return lisp::Value::Str(current->resval.rstring ? current->resval.rstring : L"");
    case RTPOINT:
      return lisp::Value::List({lisp::Value::Real(current->resval.rpoint[0]), lisp::Value::Real(current->resval.rpoint[1])});
    case RT3DPOINT:
      return lisp::Value::List({lisp::Value::Real(current->resval.rpoint[0]), lisp::Value::Real(current->resval.rpoint[1]),
                                lisp::Value::Real(current->resval.rpoint[2])});
    case RTT: return lisp::Value::True();
    case RTENAME: {
      wchar_t name[64];
      std::swprintf(name, 64, L"<Entity name: %llx>", static_cast<unsigned long long>(current->resval.rlname[0]));
      return lisp::Value::Sym(name);
    }
    default: return lisp::Value::Nil();
  }
}
}  // namespace

resbuf *ArgumentsToChain(const std::vector<lisp::Value> &args) {
  ChainBuilder builder;
  for (const lisp::Value &arg : args) builder.Add(arg);
  return builder.Release();
}

lisp::Value ChainToValue(const resbuf *chain) {
  std::vector<lisp::Value> items;
  while (chain) items.push_back(ReadOne(chain));
  if (items.size() == 1) return items.front();
  return lisp::Value::List(std::move(items));
}

std::optional<lisp::Value> CallModuleFunction(const std::wstring &name, const std::vector<lisp::Value> &args) {
  if (!devhostInvoke(name.c_str(), ArgumentsToChain(args))) return std::nullopt;
  switch (devhostResultKind()) {
    case RTNONE: return lisp::Value::Void();
    case RTNIL: return lisp::Value::Nil();
    default: {
      Chain result(devhostResultCopy());
      devhostClearResult();
      return ChainToValue(result.get());
    }
  }
}
