// Finding and loading the CLI's command plug-ins.
#pragma once

#include <ostream>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"

namespace OrvixCli {

// The plug-in folders: $ORVIX_PLUGIN_PATH (folders separated by ':') when
// set, else lib/orvixcli/plugins beside the executable's bin folder (the
// same in the build tree and in an installation), else, when the
// executable's folder cannot be found, the installation's plug-in folder.
std::vector<std::string> PluginDirectories();

// Loads every "*.so" of the folders, in name order, and calls its
// AutoCli_RegisterNamespaces with the root. A plug-in that cannot be loaded,
// has no entry point or throws while registering is reported on `err` and
// skipped; the others still load.
void LoadPlugins(const boost::shared_ptr<AutoCli::Namespace>& root, std::ostream& err);

}  // namespace OrvixCli
