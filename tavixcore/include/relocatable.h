// Whether objects of a type may move to another address by a copy of their
// bytes, with nothing left to do at the old one: true for trivially copyable
// types, and for the host classes that declare it. A TArray of such a type
// grows its buffer in place.
#pragma once

template <class T>
struct IsRelocatable {
  static constexpr bool value = __is_trivially_copyable(T);
};
