# `cmake --install BUILD --prefix DIR` gives a working orvixcli under DIR in
# the same layout as the build tree: bin/orvixcli, bin/orvix-hostsim,
# lib/liborvix_*.so, lib/orvixcli/plugins/network.so. Programs find their
# libraries through $ORIGIN/../lib; a plug-in two folders deeper through
# $ORIGIN/../.. , and the CLI finds its plug-ins beside its own folder.
install(TARGETS orvixcli orvix-hostsim RUNTIME DESTINATION bin)
install(TARGETS orvix_framework orvix_hostctl LIBRARY DESTINATION lib)
set_target_properties(orvix_network_plugin PROPERTIES INSTALL_RPATH "$ORIGIN/../..")
install(TARGETS orvix_network_plugin LIBRARY DESTINATION lib/orvixcli/plugins)
