#include "host/AdsListUser.h"

ads_list_user::ads_list_user(resbuf *chain) : m_head(chain), m_tail(lastOf(chain)), m_cursor(chain) {}

ads_list_user::ads_list_user(ads_list_user &other) {
  other.rewind();
  while (const resbuf *node = other.next()) {
    resbuf *copy = copyNode(node);
    if (!copy) {
      acdbFail(L"\n Error of allocate memory ads_list_user(ads_list_user &");
      continue;
    }
    Append(copy);
  }
}

ads_list_user::~ads_list_user() { acutRelRb(m_head); }

resbuf *ads_list_user::NewNode(short type, const ACHAR *failureMessage) {
  resbuf *node = acutNewRb(type);
  if (!node) {
    acdbFail(failureMessage);
    return nullptr;
  }
  Append(node);
  return node;
}

void ads_list_user::Append(resbuf *chain) {
  if (!chain) return;
  if (!m_head) {
    m_head = chain;
    m_cursor = chain;
  } else {
    m_tail->rbnext = chain;
  }
  m_tail = lastOf(chain);
  m_tail->rbnext = nullptr;
}

ads_list_user &ads_list_user::operator+(ads_int value) {
  if (resbuf *node = NewNode(RTSHORT, L"\n Error of allocate memory ads_list_user & operator + (ads_int)"))
    node->resval.rint = static_cast<short>(value);
  return *this;
}

ads_list_user &ads_list_user::operator+(long value) {
  if (resbuf *node = NewNode(RTLONG, L"\n Error of allocate memory ads_list_user & operator + (long )"))
    node->resval.rlong = static_cast<int32_t>(value);
  return *this;
}

ads_list_user &ads_list_user::operator+(ads_real value) {
  if (resbuf *node = NewNode(RTREAL, L"\n Error of allocate memory ads_list_user & operator + (ads_real)"))
    node->resval.rreal = value;
  return *this;
}

ads_list_user &ads_list_user::operator+(const ACHAR *text) {
  resbuf *node = acutBuildList(RTSTR, text ? text : L"", 0);
  if (!node) acdbFail(L"\n Error of allocate memory ads_list_user & operator + (char * )");
  Append(node);
  return *this;
}

ads_list_user &ads_list_user::operator+(const long pair[2]) {
  if (resbuf *node = NewNode(RTENAME, L"\n Error of allocate memory ads_list_user & operator + (long r[2])")) {
    node->resval.rlname[0] = static_cast<int32_t>(pair[0]);
    node->resval.rlname[1] = static_cast<int32_t>(pair[1]);
  }
  return *this;
}

ads_list_user &ads_list_user::operator+(const ads_point point) {
  if (resbuf *node = NewNode(RT3DPOINT, L"\n Error of allocate memory ads_list_user & operator + (ads_point)"))
    for (int i = 0; i < 3; ++i) node->resval.rpoint[i] = point[i];
  return *this;
}

ads_list_user &ads_list_user::operator+(resbuf *chain) {
  Append(chain);
  return *this;
}

resbuf *ads_list_user::rewind() {
  m_cursor = m_head;
  return m_head;
}

resbuf *ads_list_user::next() {
  resbuf *node = m_cursor;
  if (m_cursor) m_cursor = m_cursor->rbnext;
  return node;
}

ads_list_user *ads_list_user::clone() { return new ads_list_user(*this); }

int ads_list_user::retList() const { return acedRetList(m_head); }

resbuf *ads_list_user::lastOf(resbuf *chain) {
  if (!chain) return nullptr;
  while (chain->rbnext) chain = chain->rbnext;
  return chain;
}

resbuf *ads_list_user::copyNode(const resbuf *node) {
  if (!node) return nullptr;
  resbuf *copy = acutNewRb(node->restype);
  if (!copy) return nullptr;
  copy->resval = node->resval;
  if (node->restype == RTSTR) {
    copy->resval.rstring = acad__strdup(node->resval.rstring ? node->resval.rstring : L"");
    if (!copy->resval.rstring) {
      acutRelRb(copy);
      return nullptr;
    }
  }
  return copy;
}
