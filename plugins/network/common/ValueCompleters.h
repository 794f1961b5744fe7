// What the names of the network commands' parameters refer to on the host,
// for shell completion: "vswitch-name" is a standard switch, "nic-name" a
// physical NIC (an SR-IOV NIC under sriovnic), and so on. Said once here for
// the whole tree, by parameter name and part of the tree, so that no command
// declaration carries it.
#pragma once

#include "framework/AutoCli.h"

namespace OrvixCli {
namespace NetworkNamespace {

// Attaches the completers to the network namespace and, where a name means
// something else in one part of the tree, to that part. Each completer reads
// the host when called, through the host-control library.
void AttachValueCompleters(AutoCli::NamespaceNode& network);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
