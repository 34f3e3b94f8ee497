// Base class of plug-in data types carried on plugs.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VArgList.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTypeId.h>

#include <iosfwd>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxData {
public:
  enum Type {
    kData,
    kGeometryData,
    kLast
  };

  VPxData();
  virtual ~VPxData();

  virtual void copy(const VPxData &src) = 0;
  virtual VTypeId typeId() const = 0;
  virtual VString name() const = 0;

  // Reading and writing the data in scene files. ASCII reads take the words
  // of the file from argList, starting at endOfTheLastParsedElement, and leave
  // it at the last word used; binary reads take length bytes. The host's
  // defaults report kNotImplemented and the data is not saved.
  virtual VStatus readASCII(const VArgList &argList, unsigned int &endOfTheLastParsedElement);
  virtual VStatus writeASCII(std::ostream &out);
  virtual VStatus readBinary(std::istream &in, unsigned int length);
  virtual VStatus writeBinary(std::ostream &out);
};

OPENVORLA_NAMESPACE_CLOSE
