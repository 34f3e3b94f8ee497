// Interface version of the SDK, its namespace and its export marker.
#pragma once

#define VORLA_API_VERSION 20250200
#define OPENVORLA_NAMESPACE Halvern::Vorla::OpenVorla20250000
#define OPENVORLA_NAMESPACE_OPEN namespace Halvern { namespace Vorla { namespace OpenVorla20250000 {
#define OPENVORLA_NAMESPACE_CLOSE } } }
#define OPENVORLA_EXPORT __attribute__((visibility("default")))
