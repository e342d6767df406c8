#include "variable.h"

#include <string.h>

namespace {

char* copyText(const char* text) {
  const char* source = text == nullptr ? "" : text;
  const size_t length = strlen(source);
  char* copy = new char[length + 1];
  memcpy(copy, source, length + 1);
  return copy;
}

Variable::VarType knownType(Variable::VarType type) {
  switch (type) {
    case Variable::TypeNone:
    case Variable::TypeInt:
    case Variable::TypeString:
    case Variable::TypeStringArray:
      return type;
  }
  return Variable::TypeNone;
}

}  // namespace

Variable::Variable(VarType type, int count)
    : m_type(knownType(type)), m_int(0), m_text(nullptr), m_elements(nullptr), m_count(0) {
  if (m_type == TypeString) m_text = copyText("");
  if (m_type == TypeStringArray && count > 0) {
    try {
      m_elements = new char*[static_cast<size_t>(count)]();
      m_count = count;
      for (int i = 0; i < count; ++i) m_elements[i] = copyText("");
    } catch (...) {
      clear();
      throw;
    }
  }
}

Variable::Variable(const Variable& other)
    : m_type(TypeNone), m_int(0), m_text(nullptr), m_elements(nullptr), m_count(0) {
  copyFrom(other);
}

Variable::~Variable() {
  clear();
}

Variable::VarType Variable::getType() const {
  return m_type;
}

const char* Variable::getStringValue(int index) const {
  if (index == -1 && m_type == TypeString) return m_text;
  if (m_type == TypeStringArray && index >= 0 && index < m_count) return m_elements[index];
  return "";
}

int Variable::getIntValue(int index) const {
  return (index == -1 && m_type == TypeInt) ? m_int : 0;
}

int Variable::getCount() const {
  return m_type == TypeStringArray ? m_count : 0;
}

void Variable::setValue(int value, int index) {
  if (index != -1) return;
  clear();
  m_type = TypeInt;
  m_int = value;
}

void Variable::setValue(const char* value, int index) {
  if (index == -1) {
    char* text = copyText(value);
    clear();
    m_type = TypeString;
    m_text = text;
    return;
  }
  if (m_type != TypeStringArray || index < 0 || index >= m_count) return;
  char* text = copyText(value);
  delete[] m_elements[index];
  m_elements[index] = text;
}

Variable& Variable::operator=(const Variable& other) {
  if (this != &other) {
    Variable copy(other);
    clear();
    // Take over the copy's storage so that a failed allocation leaves *this intact.
    m_type = copy.m_type;
    m_int = copy.m_int;
    m_text = copy.m_text;
    m_elements = copy.m_elements;
    m_count = copy.m_count;
    copy.m_type = TypeNone;
    copy.m_text = nullptr;
    copy.m_elements = nullptr;
    copy.m_count = 0;
  }
  return *this;
}

void Variable::clear() {
  delete[] m_text;
  m_text = nullptr;
  for (int i = 0; i < m_count; ++i) delete[] m_elements[i];
  delete[] m_elements;
  m_elements = nullptr;
  m_count = 0;
  m_int = 0;
  m_type = TypeNone;
}

void Variable::copyFrom(const Variable& other) {
  try {
    m_type = other.m_type;
    m_int = other.m_int;
    if (other.m_text != nullptr) m_text = copyText(other.m_text);
    if (other.m_count > 0) {
      m_elements = new char*[static_cast<size_t>(other.m_count)]();
      m_count = other.m_count;
      for (int i = 0; i < m_count; ++i) m_elements[i] = copyText(other.m_elements[i]);
    }
  } catch (...) {
    clear();  // elements not yet copied are null
    throw;
  }
}
