// The script texts that applications are to get, under the short names of script_texts.txt, so that a table
// of expectations reads like a table of buttons. A name begins with the application's code: "Spin:menu?".
#pragma once

#include <map>
#include <string>

/// The texts by their names, each line break written \n.
const std::map<std::string, std::string>& scriptTexts();

/// The text of a name, ready to run.
std::string scriptText(const std::string& name);

/// What sent() gave, with names in place of the texts; what has no name stays as it is.
std::string named(const std::string& sent);
