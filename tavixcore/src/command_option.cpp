#include "command_option.h"

CommandOption::CommandOption()
    : m_valueCount(0), m_valueType(Variable::TypeNone), m_flag(false), m_index(-1) {}

CommandOption::CommandOption(const HString& name, int valueCount, Variable::VarType valueType,
                             bool flag)
    : m_name(name), m_valueCount(valueCount), m_valueType(valueType), m_flag(flag), m_index(-1) {}

CommandOption* CommandOption::createInstance(const HString& name, int valueCount,
                                             Variable::VarType valueType, bool flag) {
  return new CommandOption(name, valueCount, valueType, flag);
}

CommandOption CommandOption::given(int declaredIndex, const Variable& value) {
  CommandOption option;
  option.m_index = declaredIndex;
  option.m_value = value;
  return option;
}

const char* CommandOption::getName() const {
  return m_name.GetStr();
}

bool CommandOption::takesValue() const {
  return m_valueCount > 0;
}

Variable::VarType CommandOption::getValueType() const {
  return m_valueType;
}

int CommandOption::getIndex() const {
  return m_index;
}

const Variable& CommandOption::getValue() const {
  return m_value;
}
