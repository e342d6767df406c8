#include "command.h"

#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "format_text.h"
#include "log_sink.h"

struct Command::Data {
  HString name;
  HString description;
  HString extra;
  HString category;
  HString subCategory;
  std::vector<std::unique_ptr<CommandOption>> options;
  int references = 1;
};

const HRuntimeClass Command::s_classCommand = {"Command", &HObject::s_classHObject};

Command::Command(const HString& name, const HString& description, const HString& extra)
    : m_data(nullptr) {
  std::unique_ptr<Data> data(new Data);
  data->name = name;
  data->description = description;
  data->extra = extra;
  m_data = data.release();
}

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
  for (size_t i = 0; i < m_data->options.size(); ++i) {
    if (std::strcmp(m_data->options[i]->getName(), name) == 0) {
      index = static_cast<int>(i);
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
  std::unique_ptr<CommandOption> owned(option);
  owned->m_index = static_cast<int>(m_data->options.size());
  m_data->options.push_back(std::move(owned));
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
  logFormatted(LogError, format, arguments);
  va_end(arguments);
}

void Command::logWarning(const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  logFormatted(LogWarning, format, arguments);
  va_end(arguments);
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
  return static_cast<int>(m_data->options.size());
}

const CommandOption* Command::getOption(int index) const {
  if (index < 0 || index >= getNumOptions()) return nullptr;
  return m_data->options[static_cast<size_t>(index)].get();
}
