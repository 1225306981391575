#include "DemoCommands.h"

using Plinth::AutoCli::Namespace;
using Plinth::AutoCli::NamespaceNode;

extern "C" void AutoCli_RegisterNamespaces(boost::shared_ptr<NamespaceNode> root) {
    boost::shared_ptr<Namespace> demo = Namespace::New();
    demo->SetDescription("Commands that exercise the command frame.");
    demo->RegisterNamespaceNode(Demo::Echo::New(), "echo");
    demo->RegisterNamespaceNode(Demo::Fail::New(), "fail");
    demo->RegisterNamespaceNode(Demo::Throw::New(), "throw");
    demo->RegisterNamespaceNode(Demo::Bool::New(), "bool");

    boost::shared_ptr<Namespace> nic = Namespace::New();
    nic->SetDescription("Result shapes of a table.");
    nic->RegisterNamespaceNode(Demo::NicTable::New(), "list");
    demo->RegisterNamespaceNode(nic, "nic");

    boost::shared_ptr<Namespace> vswitch = Namespace::New();
    vswitch->SetDescription("Result shapes of nested structures.");
    vswitch->RegisterNamespaceNode(Demo::SwitchGet::New(), "get");
    demo->RegisterNamespaceNode(vswitch, "switch");

    root->RegisterNamespaceNode(demo, "demo");
}
