// Tests ask for more memory than there is: under the address sanitizer, too, that is a null pointer
// and not the end of the program.
extern "C" const char* __asan_default_options();
extern "C" const char* __asan_default_options() {
  return "allocator_may_return_null=1";
}
