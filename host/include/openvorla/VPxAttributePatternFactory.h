// Base class of plug-in factories that build attribute patterns from files and strings.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTypes.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxAttributePatternFactory {
public:
  VPxAttributePatternFactory();
  virtual ~VPxAttributePatternFactory();

  virtual VStatus createPatternsFromFile(const VString &fileName,
                                         VAttributePatternArray &patterns) = 0;
  virtual VStatus createPatternsFromString(const VString &definition,
                                           VAttributePatternArray &patterns) = 0;
  virtual VString name() const = 0;

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
