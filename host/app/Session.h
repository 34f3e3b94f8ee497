// What the vorla program runs once the application has started: checks of
// plug-ins, a script, the script Python reads from stdin, or the interactive
// prompt. Each needs the interpreter lock and gives the exit status.
#pragma once

#include <string>
#include <vector>

namespace vorla {

// Loads each plug-in alone, prints what the checks find, and unloads it. 1
// when a plug-in failed to load or the checks found anything.
int checkPlugins(const std::vector<std::string> &files);
// Runs the file as __main__, as python runs a script: its exception is
// printed with its traceback and the status is 1; SystemExit gives its code.
int runScript(const std::string &file);
// Runs what stdin holds as the script "<stdin>", with vorla imported.
int runStdin();
// Python's interactive prompt, with vorla imported; exit() gives its code.
int interact();

}  // namespace vorla
