// The application's array of strings.
#pragma once

#include <basekit/Tstring.h>

#include <vector>

class T_EXPORT TstringArray {
public:
  int length() const { return static_cast<int>(fItems.size()); }
  Tstring &operator[](unsigned int index) { return fItems[index]; }
  const Tstring &operator[](unsigned int index) const { return fItems[index]; }

  void append(const Tstring &item) { fItems.push_back(item); }
  void clear() { fItems.clear(); }
  void setLength(unsigned int length) { fItems.resize(length); }

private:
  std::vector<Tstring> fItems;
};
