#include "variable.h"

#include <new>

// The strings of an array value, in one block after this header, shared by
// every copy of the value; an element write by one holder first gives it a
// block of its own.
struct Variable::Array {
  int holders;
  int count;

  HString* elements() {
    static_assert(alignof(HString) <= sizeof(Array), "the strings follow the header aligned");
    return reinterpret_cast<HString*>(this + 1);
  }

  // count empty strings, or copies of from's when given.
  static Array* create(int count, Array* from) {
    void* block = ::operator new(sizeof(Array) + sizeof(HString) * static_cast<size_t>(count));
    Array* array = new (block) Array{1, 0};
    try {
      for (; array->count < count; ++array->count) {
        new (array->elements() + array->count)
            HString(from ? from->elements()[array->count] : HString());
      }
    } catch (...) {
      array->release();
      throw;
    }
    return array;
  }

  void release() {
    if (--holders > 0) return;
    for (int i = 0; i < count; ++i) elements()[i].~HString();
    ::operator delete(this);
  }
};

namespace {

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

Variable::Variable(VarType type, int count) : m_type(knownType(type)), m_int(0), m_array(nullptr) {
  if (m_type == TypeStringArray && count > 0) m_array = Array::create(count, nullptr);
}

Variable::Variable(const Variable& other)
    : m_type(other.m_type), m_int(other.m_int), m_text(other.m_text), m_array(other.m_array) {
  if (m_array != nullptr) ++m_array->holders;
}

Variable::Variable(Variable&& other) noexcept
    : m_type(other.m_type),
      m_int(other.m_int),
      m_text(static_cast<HString&&>(other.m_text)),
      m_array(other.m_array) {
  other.m_type = TypeNone;
  other.m_array = nullptr;
}

Variable::~Variable() {
  clear();
}

Variable::VarType Variable::getType() const {
  return m_type;
}

const char* Variable::getStringValue(int index) const {
  if (index == -1 && m_type == TypeString) return m_text.GetStr();
  if (index >= 0 && index < getCount()) return m_array->elements()[index].GetStr();
  return "";
}

int Variable::getIntValue(int index) const {
  return (index == -1 && m_type == TypeInt) ? m_int : 0;
}

int Variable::getCount() const {
  return m_array == nullptr ? 0 : m_array->count;
}

void Variable::setValue(int value, int index) {
  if (index != -1) return;
  clear();
  m_type = TypeInt;
  m_int = value;
}

void Variable::setValue(const char* value, int index) {
  if (index == -1) {
    m_text = value;  // first: a failed copy leaves the value as it was
    if (m_array != nullptr) m_array->release();
    m_array = nullptr;
    m_int = 0;
    m_type = TypeString;
    return;
  }
  if (index < 0 || index >= getCount()) return;
  if (m_array->holders > 1) {
    Array* own = Array::create(m_array->count, m_array);
    m_array->release();
    m_array = own;
  }
  m_array->elements()[index] = value;
}

Variable& Variable::operator=(const Variable& other) {
  if (this != &other) *this = Variable(other);
  return *this;
}

Variable& Variable::operator=(Variable&& other) noexcept {
  if (this != &other) {
    clear();
    m_type = other.m_type;
    m_int = other.m_int;
    m_text = static_cast<HString&&>(other.m_text);
    m_array = other.m_array;
    other.m_type = TypeNone;
    other.m_array = nullptr;
  }
  return *this;
}

void Variable::clear() {
  if (m_array != nullptr) m_array->release();
  m_array = nullptr;
  m_text.Empty();
  m_int = 0;
  m_type = TypeNone;
}
