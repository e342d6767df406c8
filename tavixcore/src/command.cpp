#include "command.h"

#include <string.h>

#include "format_text.h"
#include "log_sink.h"

struct Command::Data {
  Data(const HString& commandName, const HString& commandDescription, const HString& third)
      : name(commandName), description(commandDescription), extra(third) {}
  ~Data() {
    for (int i = 0; i < options.count(); ++i) delete options[i];
  }
  Data(const Data&) = delete;
  Data& operator=(const Data&) = delete;

  HString name;
  HString description;
  HString extra;
  HString category;
  HString subCategory;
  TArray<CommandOption*> options;  // owned
  int references = 1;
};

const HRuntimeClass Command::s_classCommand = {"Command", &HObject::s_classHObject};

Command::Command(const HString& name, const HString& description, const HString& extra)
    : m_data(new Data(name, description, extra)) {}

Command::~Command() {
  delete m_data;
}

const HRuntimeClass* Command::getRuntimeClass() const {
  return &s_classCommand;
}

void Command::getArgSyntaxString(HString& syntax) const {
  syntax = "";
}

bool Command::checkArgSyntax(const TArray<Variable>& /*args*/,
                             const TArray<CommandOption>& /*options*/) const {
  return true;
}

bool Command::canExecuteSolo() const {
  return true;
}

Variable::VarType Command::getReturnType() const {
  return Variable::TypeNone;
}

int Command::getOptionSyntax(const char* name, int& index, Variable::VarType& type) const {
  if (name == nullptr) return 0;
  for (int i = 0; i < m_data->options.count(); ++i) {
    if (strcmp(m_data->options[i]->getName(), name) == 0) {
      index = i;
      type = m_data->options[i]->getValueType();
      return 1;
    }
  }
  return 0;
}

bool Command::isUndoable() const {
  return false;
}

void Command::setCommandCategory(HString category, HString subCategory) {
  m_data->category = category;
  m_data->subCategory = subCategory;
}

CommandOption* Command::addOption(CommandOption* option, size_t /*size*/, bool /*flag*/) {
  if (option == nullptr) return nullptr;
  option->m_index = m_data->options.count();
  try {
    m_data->options.add(option);
  } catch (...) {
    delete option;
    throw;
  }
  return option;
}

void Command::ref() {
  ++m_data->references;
}

void Command::unref() {
  if (--m_data->references == 0) delete this;
}

void Command::logError(const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const ArgumentsEnd end(arguments);
  logMessage(LogLevel::Error, FormattedText(format, arguments).text());
}

void Command::logWarning(const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const ArgumentsEnd end(arguments);
  logMessage(LogLevel::Warning, FormattedText(format, arguments).text());
}

const char* Command::getName() const {
  return m_data->name.GetStr();
}

const char* Command::getDescription() const {
  return m_data->description.GetStr();
}

const char* Command::getCategory() const {
  return m_data->category.GetStr();
}

int Command::getNumOptions() const {
  return m_data->options.count();
}

const CommandOption* Command::getOption(int index) const {
  if (index < 0 || index >= getNumOptions()) return nullptr;
  return m_data->options[index];
}
