#include "ambrix/file_options.h"

namespace ambrix {

FileObserver::~FileObserver() = default;
void FileObserver::begins(const Step& /*step*/) {}
void FileObserver::failed(const Error& /*error*/) {}

}  // namespace ambrix
