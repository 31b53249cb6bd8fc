// A CDF file: what it is made of, its values, and changes of it. Everything is done by the commands
// of a module.
//
// clang-format off
//   ambrix::Module module;
//   auto file = ambrix::File::open(module, "a.cdf");
//   const ambrix::Variable flux = file.variable("Flux");
//   const ambrix::Array values = file.read(flux);
// clang-format on
#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <initializer_list>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/attribute.h"
#include "ambrix/description.h"
#include "ambrix/export.h"
#include "ambrix/file_error.h"
#include "ambrix/file_options.h"
#include "ambrix/module.h"
#include "ambrix/variable.h"

namespace ambrix {

class EntryFinder;

/// An open file. The module must stay where it is, and loaded, until its files are closed. Members
/// throw what the module raises, `Error`, and `FileError`. Numbers of variables and attributes
/// change when one before them is deleted: look them up again then.
///
/// A file has values of all datatypes, the extended ones included (CDF_INT8, CDF_TIME_TT2000),
/// whatever `Module::setExtended` has set. That setting holds for commands, also those by `call`.
class AMBRIX_EXPORT File {
 public:
  /// Opens a file for reading, unless the options say otherwise. Open a file once at a time.
  static File open(Module& module, const std::filesystem::path& path,
                   const FileOptions& options = {});
  /// Creates a file, for writing. The library appends ".cdf" to a path without that extension;
  /// there may be no file of this name. It is complete on disk when it is closed.
  static File create(Module& module, const std::filesystem::path& path,
                     const FileOptions& options = {});
  File(File&& other) noexcept;
  File& operator=(File&& other) noexcept;
  /// Closes the file, silently; call `close` to learn whether what was written is on disk.
  ~File();

  /// Does nothing when the file is closed already. A child of the process that opened the file only
  /// forgets it.
  void close();
  /// Deletes the file from disk.
  void remove();
  [[nodiscard]] bool isOpen() const noexcept { return static_cast<bool>(id_); }
  [[nodiscard]] Module& module() const noexcept { return *module_; }
  /// The name by which it was opened or created.
  [[nodiscard]] const std::string& path() const noexcept { return *path_; }
  /// The file as an argument of commands; none when it is closed.
  [[nodiscard]] ArrayView id() const noexcept { return id_; }

  /// Calls a command with the file as its first argument. After "close" and "delete" the file is
  /// closed. Whether the file was opened for reading is not checked here: see `FileOptions`.
  std::vector<Array> call(std::string_view command, std::span<const ArrayView> arguments);
  std::vector<Array> call(std::string_view command, std::initializer_list<double> arguments = {});
  /// The first result of a command, as a number or as the bytes of a text.
  double number(std::string_view command, std::initializer_list<double> arguments = {});
  std::string text(std::string_view command, std::initializer_list<double> arguments = {});

  /// What the file says of itself. Settings of files are made before anything is written; their
  /// values are the names that the commands have for them ("COLUMN_MAJOR").
  FileFacts facts();
  void setFormat(std::string_view format);
  void setMajority(std::string_view majority);
  void setChecksum(std::string_view checksum);
  void setCompression(const Compression& compression);

  std::size_t variableCount();
  Variable variable(std::size_t number);
  Variable variable(std::string_view name);
  std::optional<std::size_t> findVariable(std::string_view name);
  std::vector<Variable> variables();
  /// Creates a variable of this definition and returns it with its number.
  Variable createVariable(Variable definition);
  void renameVariable(const Variable& variable, std::string_view name);
  void deleteVariable(const Variable& variable);

  Compression compression(const Variable& variable);
  void setCompression(const Variable& variable, const Compression& compression);
  /// "NO_SPARSERECORDS", "PAD_SPARSERECORDS" or "PREV_SPARSERECORDS".
  std::string sparseRecords(const Variable& variable);
  void setSparseRecords(const Variable& variable, std::string_view mode);
  Array padValue(const Variable& variable);
  void setPadValue(const Variable& variable, ArrayView value);
  std::size_t blockingFactor(const Variable& variable);
  void setBlockingFactor(const Variable& variable, std::size_t records);
  /// The highest record that was written and 1, those before it included that were not.
  std::int64_t recordCount(const Variable& variable);
  /// The records that are really stored.
  std::int64_t recordsWritten(const Variable& variable);

  /// Values: first the characters of a text or the two numbers of `CDF_EPOCH16`, then the
  /// dimensions of the variable, then the records. Records that were not written are read as pad
  /// values.
  Array read(const Variable& variable);
  Array read(const Variable& variable, const Slab& slab);
  /// The same into memory of the caller's, in pieces. A few MB of temporary memory are used.
  void readInto(const Variable& variable, const Slab& slab, std::span<std::byte> memory);
  /// Writes values into records from the first on, or behind the last, or into a slab. Only the
  /// number of values counts; their order is that in which they are read.
  void write(const Variable& variable, ArrayView values, std::size_t firstRecord = 0);
  void append(const Variable& variable, ArrayView values);
  void write(const Variable& variable, const Slab& slab, ArrayView values);
  void deleteRecords(const Variable& variable, std::size_t first, std::size_t records);

  std::size_t attributeCount();
  Attribute attribute(std::size_t number);
  Attribute attribute(std::string_view name);
  std::optional<std::size_t> findAttribute(std::string_view name);
  std::vector<Attribute> attributes();
  Attribute createAttribute(std::string_view name, bool global);
  void renameAttribute(const Attribute& attribute, std::string_view name);
  void deleteAttribute(const Attribute& attribute);

  Entry entry(const Attribute& attribute, std::size_t number);
  /// The entries that there are, in the order of their numbers.
  std::vector<Entry> entries(const Attribute& attribute);
  void forEachEntry(const Attribute& attribute, const std::function<void(const Entry&)>& function);
  Array value(const Attribute& attribute, std::size_t entry);
  void putEntry(const Attribute& attribute, std::size_t entry, Datatype datatype, ArrayView value);
  void deleteEntry(const Attribute& attribute, std::size_t entry);

  /// The value of a variable's attribute, or none when it has no such entry.
  std::optional<Array> attributeValue(const Variable& variable, std::string_view name);
  /// Sets an attribute of a variable, or a global one, and creates it where there is none.
  void setAttribute(const Variable& variable, std::string_view name, Datatype datatype,
                    ArrayView value);
  void setAttribute(std::string_view name, Datatype datatype, ArrayView value,
                    std::size_t entry = 0);
  /// The same with a text of bytes, as `CDF_CHAR`.
  void setAttribute(const Variable& variable, std::string_view name, std::string_view text);
  void setAttribute(std::string_view name, std::string_view text, std::size_t entry = 0);

  /// All of the file but the values of its variables, in as few calls as it takes.
  FileDescription describe();
  VariableDescription describeVariable(std::size_t number);
  AttributeDescription describeAttribute(std::size_t number);

 private:
  File(Module& module, std::string_view command, std::string path, const FileOptions& options);
  /// Like `call`, for errors that may be no failure; `fail` then throws those that are.
  std::vector<Array> attempt(std::string_view command, std::span<const ArrayView> arguments = {});
  std::vector<Array> attempt(std::string_view command, double argument);
  [[noreturn]] void fail(const Error& error) const;
  std::vector<Array> change(std::string_view command, std::span<const ArrayView> arguments);
  std::vector<Array> change(std::string_view command, std::initializer_list<double> arguments);
  void requireOpen() const;
  void requireWritable() const;
  void requireSupported(const Variable& variable) const;
  [[nodiscard]] FileError wrongSize() const;
  void announce(Step::Kind kind, std::size_t number, std::string_view name = {}) const;
  void setReadOnly();
  std::string readEncoding();
  /// None when the library fails with one of these statuses.
  std::optional<std::size_t> find(std::string_view command, std::string_view name,
                                  std::span<const std::string_view> missing);
  AttributeDescription describeAttribute(std::size_t number, EntryFinder& finder);
  Attribute attributeFor(std::string_view name, bool global);

  Module* module_;
  std::shared_ptr<const std::string> path_;  // shared with the file that this one was moved to
  std::filesystem::path place_;              // the same, absolute
  FileOptions options_;
  Array id_;
  int process_;
};

/// The file that the library looks for under a name that may lack its extension.
AMBRIX_EXPORT std::filesystem::path fileOnDisk(const std::filesystem::path& path);

/// The value of a named constant.
AMBRIX_EXPORT double constantValue(Module& module, std::string_view name);

/// The code of the datatype, if the error is that the module does not support it.
AMBRIX_EXPORT std::optional<Datatype> unsupportedDatatype(const Error& error);
/// Whether the library has failed, and not an argument.
AMBRIX_EXPORT bool isLibraryFailure(const Error& error);
/// The same, with the status of that name ("NO_SUCH_VAR").
AMBRIX_EXPORT bool isLibraryFailure(const Error& error, std::string_view status);

}  // namespace ambrix
