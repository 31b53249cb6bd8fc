#include "tool/content/open_file.h"

#include <fmt/format.h>

#include "tool/content/failure.h"
#include "tool/format/open_failure.h"
#include "tool/output/text.h"
#include "tool/supervision/scratch_folder.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

std::string describeStep(const Step& step) {
  switch (step.kind) {
    case Step::Kind::kOpening:
      return "opening the file";
    case Step::Kind::kVariable:
      return fmt::format("reading the definition of variable {}", step.number);
    case Step::Kind::kAttribute:
      if (step.name.data() == nullptr) return fmt::format("reading attribute {}", step.number);
      return "reading attribute \"" + printable(step.name) + '"';
    case Step::Kind::kValues:
      break;
  }
  return "reading variable \"" + printable(step.name) + '"';
}

class StepObserver : public FileObserver {
 public:
  void begins(const Step& step) override { beginStep(describeStep(step)); }
};

}  // namespace

File openFile(Module& module, const std::string& path, Access access) try {
  static StepObserver observer;
  observer.begins({Step::Kind::kOpening});
  requireOpenable(path);
  return File::open(module, path, {access, &observer, scratchFolder()});
} catch (const Error& error) {
  if (!isOpenFailure(error)) throw;
  throw OpenError(explainRefusal(module, path));
}

void CreatedFileObserver::failed(const Error& error) {
  throw NamedError(shownName_, error.identifier(), error.what());
}

}  // namespace ambrix::tool
