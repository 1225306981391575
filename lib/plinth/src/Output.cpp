#include "plinth/callspec/Output.h"

namespace Plinth {
namespace CallSpec {

boost::shared_ptr<Output> Output::New() { return boost::shared_ptr<Output>(new Output()); }
Output::~Output() = default;

void Output::SetError(std::string const& text) { errors_.push_back(text); }
bool Output::HasError() const { return !errors_.empty(); }
void Output::SetResult(boost::shared_ptr<MetaObj::MetaObject> result) { result_ = result; }
void Output::Finish() { finished_ = true; }

std::vector<std::string> const& Output::GetErrors() const { return errors_; }
boost::shared_ptr<MetaObj::MetaObject> Output::GetResult() const { return result_; }
bool Output::IsFinished() const { return finished_; }

}  // namespace CallSpec
}  // namespace Plinth
