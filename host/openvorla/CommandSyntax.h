// The host's reading of a command line against the command's syntax, before
// the command's doIt runs.
#pragma once

#include <openvorla/VArgList.h>
#include <openvorla/VSyntax.h>

#include <standin/Graph.h>

#include <string>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

// Flags go by their short or long name, anywhere on the line, each followed
// by the arguments it takes; the other values are the command's arguments,
// in the kinds the syntax gives them, then its objects (names). Each value
// goes into `list` in its place, converted to its kind (a number given as
// text to a number, an integral number to an integer, ...). A misuse is
// kInvalidParameter, with a message naming the flag or the argument.
VStatus parseCommandLine(const std::string &command, const VSyntax &syntax,
                         const std::vector<standin::Value> &args, VArgList *list);

// The values as they are, for a command without a syntax to check against:
// integral numbers as integers.
void plainCommandLine(const std::vector<standin::Value> &args, VArgList *list);

OPENVORLA_NAMESPACE_CLOSE
