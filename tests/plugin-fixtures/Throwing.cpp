// A plug-in whose registration fails half-way, after it has built part of
// its tree but before it attached its root.
#include <stdexcept>

#include "framework/AutoCli.h"

extern "C" __attribute__((visibility("default"))) void AutoCli_RegisterNamespaces(
    boost::shared_ptr<AutoCli::Namespace> parent) {
    auto root = AutoCli::Namespace::New();
    root->SetDescription("Half-built");
    root->RegisterNamespaceNode(AutoCli::Namespace::New(), "inner");
    if (parent) throw std::runtime_error("cannot build the broken tree");
    parent->RegisterNamespaceNode(root, "broken");
}
