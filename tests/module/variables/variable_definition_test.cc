// Creating variables: arguments, variances, and what the library refuses.
#include "tests/module/support/module_test.h"
#include "tests/support/datatypes.h"

namespace ambrix_test {
namespace {

/// The text of a call of "createVar" for a variable "v" without records.
class VariableDefinitionTest : public ModuleTest {
 protected:
  std::string creates(const Given& datatype, const Given& elements, const Given& sizes,
                      const Given& recordVariance, const Given& variances) {
    const std::string text =
        does("createVar", {file, "v", datatype, elements, sizes, recordVariance, variances});
    if (text == "double 1x1 [0]") results("deleteVar", {file, 0});
    return text;
  }
  Given file = create();
};

const std::string kCreated = "double 1x1 [0]";
const std::string kBadVariance = "TOLVEX:ambrix:cdflib:badVarianceDatatype()";

std::string refusedCreation(const char* statusText) {
  return refused("CDFcreatezVar", statusText);
}

Given logicals(std::initializer_list<bool> values) {
  return Array::row<bool>(values);
}

TEST_F(VariableDefinitionTest, VariablesAreNumberedFromZero) {
  EXPECT_EQ(createVar(file, {.name = "a"}), 0);
  EXPECT_EQ(createVar(file, {.name = "b"}), 1);
  EXPECT_EQ(does("getVarNum", {file, "b"}), "double 1x1 [1]");
  EXPECT_EQ(does("getVarName", {file, 0}), "char 1x1 'a'");
}

TEST_F(VariableDefinitionTest, VariancesAreLogicalsOrDoubles) {
  createVar(file, {.name = "other"});
  const auto variancesOf = [this](const Given& recordVariance, const Given& variances) {
    results("createVar", {file, "v", 4, 1, {2, 3}, recordVariance, variances});
    const std::vector<Array> facts = results("inquireVar", {file, 1});
    results("deleteVar", {file, 1});
    return shown(facts[4]) + ' ' + shown(facts[5]);
  };
  EXPECT_EQ(variancesOf(Array::scalar(true), logicals({true, false})),
            "logical 1x1 [1] logical 1x2 [1 0]");
  EXPECT_EQ(variancesOf(Array::scalar(false), {0, -1}), "logical 1x1 [0] logical 1x2 [0 1]");
  EXPECT_EQ(variancesOf(-1, logicals({false, true})), "logical 1x1 [1] logical 1x2 [0 1]");
  EXPECT_EQ(variancesOf(-1.9, {-0.5, 0.7}), "logical 1x1 [1] logical 1x2 [0 0]");
  EXPECT_EQ(variancesOf(0, {-1.99, 0.99}), "logical 1x1 [0] logical 1x2 [1 0]");
}

TEST_F(VariableDefinitionTest, OnlyTheFirstRecordVarianceCounts) {
  EXPECT_EQ(creates(4, 1, {}, {0, -1, -1}, {}), kCreated);
  results("createVar", {file, "v", 4, 1, {}, {0, -1, -1}, {}});
  EXPECT_EQ(shown(results("inquireVar", {file, 0})[4]), "logical 1x1 [0]");
}

TEST_F(VariableDefinitionTest, OtherNumbersAreNoVariance) {
  EXPECT_EQ(creates(4, 1, {}, 1, {}), unrecognized(1, "VARIANCE"));
  EXPECT_EQ(creates(4, 1, {}, -2, {}), unrecognized(-2, "VARIANCE"));
  EXPECT_EQ(creates(4, 1, {}, {-1, 5}, {}), unrecognized(5, "VARIANCE"));
  EXPECT_EQ(creates(4, 1, {2, 3}, -1, {-1, 1}), unrecognized(1, "VARIANCE"));
  EXPECT_EQ(creates(4, 1, {2}, -1, {4294967295.0}), unrecognized(4294967295, "VARIANCE"));
}

TEST_F(VariableDefinitionTest, VariancesOutOfRangeAreOutOfBounds) {
  EXPECT_EQ(creates(4, 1, {}, 1e19, {}), kOutOfBounds);
  EXPECT_EQ(creates(4, 1, {2}, -1, {-9223372036854775808.0}), kOutOfBounds);
}

TEST_F(VariableDefinitionTest, OtherClassesAreNoVariance) {
  EXPECT_EQ(creates(4, 1, {}, "x", {}), kBadVariance);
  EXPECT_EQ(creates(4, 1, {}, "VARY", {}), kBadVariance);
  EXPECT_EQ(creates(4, 1, {}, row<std::int8_t>({-1}), {}), kBadVariance);
  EXPECT_EQ(creates(4, 1, {2}, -1, row<float>({-1})), kBadVariance);
  EXPECT_EQ(creates(4, 1, {2}, -1, Array::cell({1, 1})), kBadVariance);
  EXPECT_EQ(creates(4, 1, {}, "", {}), kBadVariance);
}

TEST_F(VariableDefinitionTest, SizesOfOtherClassesAreConvertedByValue) {
  for (const Given& sizes : {row<std::int32_t>({2, 3}), row<float>({2, 3}),
                             row<std::uint64_t>({2, 3}), Given(Array::text(u"\u0002\u0003"))}) {
    results("createVar", {file, "v", 4, 1, sizes, -1, {-1, -1}});
    EXPECT_EQ(shown(results("inquireVar", {file, 0})[3]), "double 1x2 [2 3]");
    results("deleteVar", {file, 0});
  }
  results("createVar", {file, "v", 4, 1, logicals({true, true}), -1, {-1, -1}});
  EXPECT_EQ(shown(results("inquireVar", {file, 0})[3]), "double 1x2 [1 1]");
  EXPECT_EQ(creates(4, 1, row<std::uint64_t>({~std::uint64_t{0}}), -1, -1), kOutOfBounds);
}

TEST_F(VariableDefinitionTest, DatatypeElementsAndSizesAreTheLibrarysToJudge) {
  EXPECT_EQ(creates(3, 1, {}, -1, {}), refusedCreation(kBadDataType));
  EXPECT_EQ(creates(4, 2, {}, -1, {}), refusedCreation(kBadNumElems));
  EXPECT_EQ(creates(51, 0, {}, -1, {}), refusedCreation(kBadNumElems));
  EXPECT_EQ(creates(4, 1, {0}, -1, -1), refusedCreation(kBadDimSize));
  EXPECT_EQ(creates(4, 1, {2, -1}, -1, {-1, -1}), refusedCreation(kBadDimSize));
  const Given eleven = Array::of<double>(std::vector<double>(11, 1.0), {1, 11});
  const Given novary = Array::zeros(ClassId::kDouble, {1, 11});
  EXPECT_EQ(creates(4, 1, eleven, -1, novary), refusedCreation(kBadNumDims));
}

TEST_F(VariableDefinitionTest, NumbersBeyond32BitsAreNotCut) {
  const double beyond = 4294967296.0;
  EXPECT_EQ(creates(beyond + 4, 1, {}, -1, {}), refusedCreation(kBadDataType));
  EXPECT_EQ(creates(4, beyond + 1, {}, -1, {}), refusedCreation(kBadNumElems));
  EXPECT_EQ(creates(4, 1, {beyond + 2}, -1, -1), refusedCreation(kBadDimSize));
}

TEST_F(VariableDefinitionTest, EveryDatatypeHasItsLowerCaseName) {
  for (const CdfDatatype& datatype : kCdfDatatypes) {
    const std::string name = lowerCaseName(datatype);
    const double variable = createVar(file, {.datatype = datatype.code, .name = name.c_str()});
    EXPECT_EQ(results("inquireVar", {file, variable})[1].utf8(), name);
  }
}

TEST_F(VariableDefinitionTest, UnsupportedDatatypesCanBeCreatedButNotInquired) {
  for (const long datatype : {8L, 33L}) {
    const std::string name = "v" + std::to_string(datatype);
    results("createVar", {file, name.c_str(), static_cast<double>(datatype), 1, {}, -1, {}});
    const double variable = number("getVarNum", {file, name.c_str()});
    EXPECT_EQ(does("inquireVar", {file, variable}), unrecognized(datatype, "DATATYPE"));
    EXPECT_EQ(does("getVarData", {file, variable, 0}), unrecognized(datatype, "DATATYPE"));
  }
}

TEST_F(VariableDefinitionTest, NamesAreTheLibrarysToJudge) {
  createVar(file, {.name = "taken"});
  EXPECT_EQ(does("createVar", {file, "taken", 4, 1, {}, -1, {}}), refusedCreation(kVarExists));
  EXPECT_EQ(does("createVar", {file, "caf\xE9", 4, 1, {}, -1, {}}), refusedCreation(kBadVarName));
  EXPECT_EQ(does("createVar", {file, std::string(300, 'n').c_str(), 4, 1, {}, -1, {}}),
            refusedCreation(kVarNameTrunc));
}

}  // namespace
}  // namespace ambrix_test
