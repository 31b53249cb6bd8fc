// The CDF library takes settings from the environment; the tests expect its defaults.
#include <gmock/gmock.h>
#include <unistd.h>

#include <cstdlib>
#include <string>
#include <vector>

int main(int argc, char** argv) {
  std::vector<std::string> names;
  for (char** variable = environ; *variable != nullptr; ++variable) {
    const std::string text = *variable;
    if (text.starts_with("CDF_")) names.push_back(text.substr(0, text.find('=')));
  }
  for (const std::string& name : names)
    unsetenv(name.c_str());
  testing::InitGoogleMock(&argc, argv);
  return RUN_ALL_TESTS();
}
