// A result-buffer chain under construction: appends chain, the list owns every node and
// releases the whole chain when it goes.
#pragma once

#include "host/HostApi.h"

class ads_list_user {
 public:
  ads_list_user() = default;
  explicit ads_list_user(resbuf *chain);
  ads_list_user(ads_list_user &other);
  ads_list_user &operator=(const ads_list_user &) = delete;
  virtual ~ads_list_user();

  ads_list_user &operator+(ads_int value);
  ads_list_user &operator+(long value);
  ads_list_user &operator+(ads_real value);
  ads_list_user &operator+(const ACHAR *text);
  ads_list_user &operator+(const long pair[2]);
  ads_list_user &operator+(const ads_point point);
  ads_list_user &operator+(resbuf *chain);

  resbuf *head() const { return m_head; }
  resbuf *tail() const { return m_tail; }
  resbuf *rewind();
  resbuf *next();
  bool isEmpty() const { return m_head == nullptr; }
  ads_list_user *clone();
  int retList() const;

  static resbuf *lastOf(resbuf *chain);
  static resbuf *copyNode(const resbuf *node);

 private:
  resbuf *NewNode(short type, const ACHAR *failureMessage);
  void Append(resbuf *chain);

  resbuf *m_head = nullptr;
  resbuf *m_tail = nullptr;
  resbuf *m_cursor = nullptr;
};
