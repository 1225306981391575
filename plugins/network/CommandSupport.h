#pragma once

// What every command source of the plug-in uses, by short names: the
// framework's call specifications and result values, parameter declarations,
// and the host libraries' failure type.

#include <memory>
#include <string>

#include "gantry/lib/GantryException.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/Parameter.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "plinth/metaobj/MetaStruct.h"
#include "util/OwnedVector"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Lib::GantryException;
using Plinth::CallSpec::Input;
using Plinth::CallSpec::InputSpec;
using Plinth::CallSpec::InputSpecOf;
using Plinth::CallSpec::Output;
using Plinth::CallSpec::OutputSpec;
using Plinth::CallSpec::Parameter;
using Plinth::MetaObj::MetaBool;
using Plinth::MetaObj::MetaInt;
using Plinth::MetaObj::MetaList;
using Plinth::MetaObj::MetaString;
using Plinth::MetaObj::MetaStruct;
using Trellis::Util::OwnedVector;

}  // namespace NetworkNamespace
}  // namespace KorvexCli
