// CMySet: an ordered set of distinct values, used for the notes of a chord and for
// sets of key numbers and note numbers.
//
// It has the member names of std::set. The values are kept in flat sorted storage,
// so iteration is a walk over contiguous memory; unlike std::set, insert and erase
// invalidate iterators. Elements are read through const iterators only (a value's
// position depends on it); a CNote's spelling is mutable and may still be changed.
#ifndef TONVEX_MYSET_H
#define TONVEX_MYSET_H

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <utility>
#include <vector>

template <class T>
class CMySet {
  using Storage = std::vector<T>;

public:
  using value_type = T;
  using size_type = std::size_t;
  using const_iterator = typename Storage::const_iterator;
  using iterator = const_iterator;
  using const_reverse_iterator = typename Storage::const_reverse_iterator;

  CMySet() = default;
  CMySet(std::initializer_list<T> values) { insert(values.begin(), values.end()); }
  template <class InputIt>
  CMySet(InputIt first, InputIt last) {
    insert(first, last);
  }

  /// Inserts the value unless an equal one is present; returns its position and
  /// whether it was inserted.
  std::pair<iterator, bool> insert(T const& value) {
    auto pos = std::lower_bound(values_.begin(), values_.end(), value);
    if (pos != values_.end() && !(value < *pos)) return {pos, false};
    return {values_.insert(pos, value), true};
  }
  template <class InputIt>
  void insert(InputIt first, InputIt last) {
    for (; first != last; ++first) insert(*first);
  }

  /// Position of the value, or end().
  const_iterator find(T const& value) const {
    auto pos = std::lower_bound(values_.begin(), values_.end(), value);
    return (pos != values_.end() && !(value < *pos)) ? pos : values_.end();
  }
  size_type count(T const& value) const { return find(value) != end() ? 1 : 0; }

  /// Removes the value if present; returns the number removed (0 or 1).
  size_type erase(T const& value) {
    auto pos = find(value);
    if (pos == end()) return 0;
    values_.erase(pos);
    return 1;
  }
  /// Removes the value at pos; returns the position after it.
  iterator erase(const_iterator pos) { return values_.erase(pos); }

  size_type size() const { return values_.size(); }
  bool empty() const { return values_.empty(); }
  void clear() { values_.clear(); }

  const_iterator begin() const { return values_.begin(); }
  const_iterator end() const { return values_.end(); }
  const_reverse_iterator rbegin() const { return values_.rbegin(); }
  const_reverse_iterator rend() const { return values_.rend(); }

  friend bool operator==(CMySet const& a, CMySet const& b) { return a.values_ == b.values_; }
  friend bool operator!=(CMySet const& a, CMySet const& b) { return !(a == b); }

private:
  Storage values_;
};

#endif
