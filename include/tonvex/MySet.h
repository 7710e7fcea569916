// CMySet: an ordered set of distinct values, used for the notes of a chord and for
// sets of key numbers and note numbers.
//
// It has the member names of std::set. The values are kept in flat sorted storage,
// so iteration is a walk over contiguous memory and the iterators are plain
// pointers; unlike std::set, insert and erase invalidate iterators. Elements are
// read through const iterators only (a value's position depends on it); a CNote's
// spelling is mutable and may still be changed.
//
// Up to InlineCapacity values live inside the object itself, so the sets a chord
// needs (a chord rarely has more than a dozen notes) never touch the heap: building,
// copying and clearing them allocates nothing. A larger set moves to the heap, and
// keeps that storage through clear() for its next use, as a vector keeps its
// capacity. Moving a set whose values are inline moves them one by one (the
// iterators of the source do not carry over); a set on the heap hands over its
// storage.
#ifndef TONVEX_MYSET_H
#define TONVEX_MYSET_H

#include "TonvexExport.h"

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <iterator>
#include <memory>
#include <new>
#include <type_traits>
#include <utility>

template <class T>
class CMySet {
public:
  using value_type = T;
  using size_type = std::size_t;
  using const_iterator = T const*;
  using iterator = const_iterator;
  using const_reverse_iterator = std::reverse_iterator<const_iterator>;

  /// How many values the set holds without a heap allocation.
  static constexpr size_type InlineCapacity = 16;

  CMySet() noexcept {}
  CMySet(std::initializer_list<T> values) { insert(values.begin(), values.end()); }
  template <class InputIt>
  CMySet(InputIt first, InputIt last) {
    insert(first, last);
  }
  CMySet(CMySet const& other) { CopyFrom(other); }
  CMySet(CMySet&& other) noexcept(std::is_nothrow_move_constructible_v<T>) { TakeFrom(other); }
  CMySet& operator=(CMySet const& other) {
    if (this != &other) {
      clear();
      CopyFrom(other);
    }
    return *this;
  }
  CMySet& operator=(CMySet&& other) noexcept(std::is_nothrow_move_constructible_v<T>) {
    if (this != &other) {
      Release();
      TakeFrom(other);
    }
    return *this;
  }
  ~CMySet() { Release(); }

  /// Inserts the value unless an equal one is present; returns its position and
  /// whether it was inserted.
  std::pair<iterator, bool> insert(T const& value) {
    // Sets are mostly filled in ascending order: a value above the last one goes to
    // the end without a search.
    T* pos = (Size_ != 0 && Data_[Size_ - 1] < value) ? Data_ + Size_ : std::lower_bound(Data_, Data_ + Size_, value);
    if (pos != Data_ + Size_ && !(value < *pos)) return {pos, false};
    // A value equal to none of the elements is no reference into them, so growing
    // cannot leave it dangling.
    if (Size_ == Capacity_) {
      auto const index = pos - Data_;
      Grow();
      pos = Data_ + index;
    }
    // The new last element, then every value after pos one place up.
    T* const end = Data_ + Size_;
    if (pos == end) {
      ::new (static_cast<void*>(end)) T(value);
      ++Size_;
    } else {
      ::new (static_cast<void*>(end)) T(std::move(end[-1]));
      ++Size_;
      for (T* p = end - 1; p != pos; --p) *p = std::move(p[-1]);
      *pos = value;
    }
    return {pos, true};
  }
  template <class InputIt>
  void insert(InputIt first, InputIt last) {
    for (; first != last; ++first) insert(*first);
  }

  /// Position of the value, or end().
  const_iterator find(T const& value) const {
    T const* pos = std::lower_bound(begin(), end(), value);
    return (pos != end() && !(value < *pos)) ? pos : end();
  }
  size_type count(T const& value) const { return find(value) != end() ? 1 : 0; }

  /// Removes the value if present; returns the number removed (0 or 1).
  size_type erase(T const& value) {
    const_iterator pos = find(value);
    if (pos == end()) return 0;
    erase(pos);
    return 1;
  }
  /// Removes the value at pos; returns the position after it.
  iterator erase(const_iterator pos) {
    T* const at = Data_ + (pos - Data_);
    T* const last = Data_ + --Size_;
    for (T* p = at; p != last; ++p) *p = std::move(p[1]);
    std::destroy_at(last);
    return at;
  }

  size_type size() const { return Size_; }
  bool empty() const { return Size_ == 0; }
  /// Removes all values; storage on the heap is kept for the next values.
  void clear() {
    std::destroy(Data_, Data_ + Size_);
    Size_ = 0;
  }

  const_iterator begin() const { return Data_; }
  const_iterator end() const { return Data_ + Size_; }
  const_reverse_iterator rbegin() const { return const_reverse_iterator(end()); }
  const_reverse_iterator rend() const { return const_reverse_iterator(begin()); }

  friend bool operator==(CMySet const& a, CMySet const& b) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin());
  }
  friend bool operator!=(CMySet const& a, CMySet const& b) { return !(a == b); }

private:
  T* InlineData() { return static_cast<T*>(static_cast<void*>(Inline_)); }
  bool OnHeap() const { return Capacity_ > InlineCapacity; }

  // Doubles the room, moving the values to the heap.
  void Grow() {
    // Capacity_ is never below InlineCapacity; saying so spares the compiler a
    // path with an empty allocation.
    size_type const capacity = 2 * std::max(Capacity_, InlineCapacity);
    T* const fresh = std::allocator<T>().allocate(capacity);
    std::uninitialized_move(Data_, Data_ + Size_, fresh);
    std::destroy(Data_, Data_ + Size_);
    if (OnHeap()) std::allocator<T>().deallocate(Data_, Capacity_);
    Data_ = fresh;
    Capacity_ = capacity;
  }
  // Into an empty set.
  void CopyFrom(CMySet const& other) {
    while (Capacity_ < other.Size_) Grow();
    std::uninitialized_copy(other.begin(), other.end(), Data_);
    Size_ = other.Size_;
  }
  // Into a set without storage of its own; leaves the other one empty and inline.
  void TakeFrom(CMySet& other) {
    if (other.OnHeap()) {
      Data_ = other.Data_;
      Capacity_ = other.Capacity_;
      Size_ = other.Size_;
      other.Data_ = other.InlineData();
      other.Capacity_ = InlineCapacity;
      other.Size_ = 0;
      return;
    }
    std::uninitialized_move(other.Data_, other.Data_ + other.Size_, Data_);
    Size_ = other.Size_;
    other.clear();
  }
  // Destroys the values and gives back heap storage: the set is empty and inline.
  void Release() {
    clear();
    if (OnHeap()) std::allocator<T>().deallocate(Data_, Capacity_);
    Data_ = InlineData();
    Capacity_ = InlineCapacity;
  }

  T* Data_ = InlineData();
  size_type Size_ = 0;
  size_type Capacity_ = InlineCapacity;
  alignas(T) unsigned char Inline_[InlineCapacity * sizeof(T)];
};

#endif
