// The failure convention of tovrin.
//
// Every check of the library that fails raises EMathError carrying one message identifier;
// what() is the identifier's text at the moment of the raise. Str2Float raises
// EConvertError; a read that would go through a missing row table raises EAccessViolation.
// The texts are resource strings: SetResString replaces one at run time (for translation),
// and LoadResString reads the text in force. Both are safe to call from several threads.
#pragma once

#include <cstdint>
#include <exception>
#include <string>

namespace tovrin {

enum TResStringId : std::uint16_t {
  // Vectors
  rsVectorIsEmpty,
  rsVectorNeg,
  rsVectorZero,
  rsVectorNotPos,
  rsValueNotZero,
  rsSameDimensions,
  rsMagZero,
  rsDivideByZero,
  // Sample statistics and parameter ranges
  rsVectorG1,
  rsVectorG2,
  rsVectorG3,
  rsStdDev,
  rsValue01,
  rsValue01Inc,
  rsValueGEZero,
  rsValueGZero,
  rsValue2,
  rsDF,
  rsSameValue,
  rsInvalidValue,
  // Discrete and exponential distributions
  rsBinomInvalid,
  rsBinomOverflowed,
  rsBinomDistInvalid,
  rsPermInvalid,
  rsPermOverflowed,
  rsFactOverflow,
  rsPoissonInvalid,
  rsHyperGeometricInvalid,
  rsExpDistInvalid,
  // Grouped data
  rsMedianNotFound,
  rsQuartilesNotFound,
  // Matrices
  rsMatrixIsEmpty,
  rsMatrixRect,
  rsMatrixSqr,
  rsMatrixMult,
  rsMatrixNeg,
  rsMatrixNotPos,
  rsMatrixZero,
  rsInvalidRow,
  rsInvalidCol,
  rsNoInvert,
  // Random variates
  rsInvalidMean,
  rsInvalidStdDev,
  rsInvalidShape,
  rsShapeTooSmall,
  rsVectorEmpty,
  rsVectorTooSmall,
  // Geometry
  rsLengthNotNeg,
  rsInvalidSides,
  rsAngleNotLEPi,
  // Edit controls
  rsNA,
  // Special functions
  rsArgOutsideDomain,
  rsGammaPole,
  rsResStringCount  // not an identifier: the number of identifiers
};

// The text in force for an identifier.
std::string LoadResString(TResStringId Ident);
// Replaces the text of an identifier (for translation). Raises std::out_of_range for a value
// that is not an identifier.
void SetResString(TResStringId Ident, std::string Text);
// Restores every text of this table to the library's own (the statistics report labels have
// their own table, TOVRIN_RS_DescStats.h).
void ResetResStrings();
// The identifier's name, e.g. "rsVectorIsEmpty".
const char* ResStringName(TResStringId Ident);

class EMathError : public std::exception {
 public:
  explicit EMathError(TResStringId Ident);
  const char* what() const noexcept override { return message_.c_str(); }
  TResStringId Ident() const noexcept { return ident_; }

 private:
  TResStringId ident_;
  std::string message_;
};

class EConvertError : public std::exception {
 public:
  explicit EConvertError(std::string Message) : message_(std::move(Message)) {}
  const char* what() const noexcept override { return message_.c_str(); }

 private:
  std::string message_;
};

class EAccessViolation : public std::exception {
 public:
  explicit EAccessViolation(std::string Message) : message_(std::move(Message)) {}
  const char* what() const noexcept override { return message_.c_str(); }

 private:
  std::string message_;
};

namespace detail {
// The one route by which a failed check leaves the library.
[[noreturn]] void RaiseMathError(TResStringId Ident);
}  // namespace detail

}  // namespace tovrin
