// A typed script value: nothing, an integer, a string or an array of strings.
// Index -1 names the plain value, 0..count-1 an element of an array.
#pragma once

#include "core_export.h"
#include "hstring.h"

class TAVIXCORE_API Variable {
 public:
  enum VarType { TypeNone = 0, TypeInt = 1, TypeString = 3, TypeStringArray = 19 };

  // An array (TypeStringArray) starts with count empty strings; other types
  // ignore count. Any other type code gives TypeNone.
  Variable(VarType type = TypeNone, int count = 0);  // NOLINT(google-explicit-constructor)
  // Copies share an array's strings until either side writes an element.
  Variable(const Variable& other);
  // Takes other's value; other is left TypeNone.
  Variable(Variable&& other) noexcept;
  virtual ~Variable();
  virtual VarType getType() const;

  // The plain text of a string, or an element's text of an array. Anything
  // else (other types, indexes out of range) reads as the empty text. The
  // pointer stays valid while the value is unchanged.
  const char* getStringValue(int index) const;
  // The plain integer; anything else reads as 0.
  int getIntValue(int index) const;
  // Elements of an array: 0 when the value is no array.
  int getCount() const;

  // Index -1 makes the value an integer, or a string (null counts as empty).
  // An index 0..count-1 of an array sets that element's text; an integer
  // cannot be stored in an array, and other indexes write nothing.
  void setValue(int value, int index);
  void setValue(const char* value, int index);

  // As the copy constructor; a failed copy leaves this value as it was.
  Variable& operator=(const Variable& other);
  Variable& operator=(Variable&& other) noexcept;

 private:
  struct Array;
  void clear();

  VarType m_type;
  int m_int;
  HString m_text;
  Array* m_array;  // shared by copies; counts its holders
};
