// Writes a CDF file: a variable of three numbers a record, and the times of its records.
//
// usage: write_file FILE

#include <ambrix/file.h>
#include <ambrix/times.h>

#include <exception>
#include <iostream>
#include <span>
#include <string>
#include <vector>

namespace {

using ambrix::Array;
using ambrix::Datatype;
using ambrix::File;
using ambrix::Variable;

const std::vector<std::string> kTimes = {"2024-05-10T12:00:00", "2024-05-10T12:00:01",
                                         "2024-05-10T12:00:02"};
const std::vector<float> kFluxes = {1.5F, 2.5F, 3.5F, 4.5F, 5.5F, 6.5F, 7.5F, 8.5F, 9.5F};

void writeFile(const char* path) {
  ambrix::Module module;
  File file = File::create(module, path);
  file.setAttribute("Project", "Example");

  const Variable epoch = file.createVariable({.name = "Epoch", .datatype = Datatype::kEpoch});
  file.write(epoch, ambrix::timesFromText(module, kTimes, epoch.datatype));

  const Variable flux =
      file.createVariable({.name = "Flux", .datatype = Datatype::kReal4, .sizes = {3}});
  file.setCompression(flux, {"GZIP_COMPRESSION", "6"});
  // The array borrows the numbers: nothing is copied on the way to the file.
  file.write(flux, Array::borrowed(std::span<const float>(kFluxes), {3, kTimes.size()}));
  file.setAttribute(flux, "DEPEND_0", "Epoch");
  file.setAttribute(flux, "FILLVAL", flux.datatype, Array::scalar(-1e31F));
  file.close();  // what fails now is told; the file would also be closed at the end of the function
}

}  // namespace

int main(int argumentCount, char** arguments) {
  if (argumentCount != 2) {
    std::cerr << "usage: write_file FILE\n";
    return 2;
  }
  try {
    writeFile(arguments[1]);
    return 0;
  } catch (const std::exception& error) {
    std::cerr << "write_file: " << error.what() << '\n';
    return 1;
  }
}
