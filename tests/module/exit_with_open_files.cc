// usage: exit_with_open_files WAY
//
// Changes kept.cdf, makes made.cdf, and ends with both open: in the way of a module that goes out
// of scope ("scope"), of one that is static ("static"), by std::exit ("exit"), by std::exit after a
// child has ended so first and the files were written once more ("child"), or by std::exit in a
// child that has opened them itself ("own").
#include <ambrix/embedded.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <optional>
#include <string_view>

namespace {

using ambrix::Array;
using ambrix::Module;

std::optional<Module> staticModule;

void writeRecord(Module& module, const Array& file, int record) {
  module.call("putVarRecordData", {file, Array::scalar(0.0), Array::scalar(double(record)),
                                   Array::scalar(std::int32_t{record + 1})});
}

void openAndWrite(Module& module, bool oneMore) {
  const Array kept = std::move(module.call("open", {Array::fromNarrow("kept")}).at(0));
  const Array made = std::move(module.call("create", {Array::fromNarrow("made")}).at(0));
  const Array none = Array::zeros(ambrix::ClassId::kDouble, {0, 0});
  module.call("createVar", {made, Array::fromNarrow("v"), Array::scalar(4.0), Array::scalar(1.0),
                            none, Array::scalar(true), none});
  for (const Array* const file : {&kept, &made}) {
    for (int record = 0; record < 2; ++record)
      writeRecord(module, *file, record);
  }
  if (!oneMore) return;
  const pid_t child = fork();
  if (child == 0) std::exit(0);
  waitpid(child, nullptr, 0);
  for (const Array* const file : {&kept, &made})
    writeRecord(module, *file, 2);
}

}  // namespace

int main(int, char** arguments) {
  const std::string_view way = arguments[1];
  if (way == "static") {
    openAndWrite(staticModule.emplace(), false);
    return 0;
  }
  Module module;
  if (way == "own" && fork() != 0) {
    wait(nullptr);
    return 0;
  }
  openAndWrite(module, way == "child");
  if (way != "scope") std::exit(0);
}
