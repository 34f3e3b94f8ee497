// Base class of plug-in translators that filter the ASCII scene format.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxFileTranslator.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxVorlaAsciiFilter : public VPxFileTranslator {
public:
  VPxVorlaAsciiFilter();
  ~VPxVorlaAsciiFilter() override;
};

OPENVORLA_NAMESPACE_CLOSE
