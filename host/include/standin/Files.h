// Stand-in only: the host's side of file operations, for tests and for the
// host's own readers and writers.
#pragma once

#include <openvorla/VPxFileTranslator.h>
#include <openvorla/VPxVorlaAsciiFilterOutput.h>

namespace standin {

// What VPxFileTranslator::fileAccessMode() reports.
OPENVORLA_EXPORT void setFileAccessMode(
    OPENVORLA_NAMESPACE::VPxFileTranslator::FileAccessMode mode);
// The text written to the output so far, as UTF-8.
OPENVORLA_EXPORT const char *outputText(const OPENVORLA_NAMESPACE::VPxVorlaAsciiFilterOutput &out);
// The text of the scene that an ASCII filter's writer wrote last; "" before any.
OPENVORLA_EXPORT const char *lastWrittenScene();

}  // namespace standin
