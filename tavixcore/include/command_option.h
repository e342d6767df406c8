// A command option. Declared options are made with createInstance and handed
// to Command::addOption; the options given to a run carry the declared-option
// index they stand for (0 = the first one added) and their value.
#pragma once

#include "core_export.h"
#include "hstring.h"
#include "variable.h"

class TAVIXCORE_API CommandOption {
 public:
  // A declared option: its name, 1 when it carries a value (0 for a flag),
  // the value's type, and a flag this host does not use.
  static CommandOption* createInstance(const HString& name, int valueCount,
                                       Variable::VarType valueType, bool flag);

  // An option given to a run: the declared option it stands for and its value.
  static CommandOption given(int declaredIndex, const Variable& value);

  CommandOption();

  const char* getName() const;
  bool takesValue() const;
  Variable::VarType getValueType() const;
  int getIndex() const;
  const Variable& getValue() const;

 private:
  friend class Command;
  CommandOption(const HString& name, int valueCount, Variable::VarType valueType, bool flag);

  HString m_name;
  int m_valueCount;
  Variable::VarType m_valueType;
  bool m_flag;
  int m_index;
  Variable m_value;
};
