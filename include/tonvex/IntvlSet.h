// Interval sets: the intervals, in semitones, that a chord's notes stand above its
// root.
//
// A CIntvlSet holds distinct intervals in ascending order together with a wrap
// interval that every inserted value is folded by. With a wrap interval of 12 all
// values fall into one octave; with 24 (the chord type catalogue, Inversion's result,
// the chord model) a ninth stays 14 and a thirteenth 21. Interval 0 (the root) is an
// ordinary member: it is there only when it was inserted.
//
// Insertion rule, used by every operation that adds a value: a negative value is
// raised by whole octaves (12) to the smallest value 0 or above; then it is taken
// modulo the wrap interval; then it is inserted unless present.
//   -1 -> 11, -13 -> 11, 19 -> 7 (wrap 12) or 19 (wrap 24), 200 -> 8 (wrap 24).
// A wrap interval of 0 or below is never chosen by the library; it is defined all the
// same: a negative wrap interval folds like its magnitude (so -1 folds everything to
// 0, as the truncating remainder of C++ gives), and 0 means no folding at all (values
// are only raised out of the negative range). Under every wrap interval a stored
// value is left unchanged by the insertion rule, so the set never holds a value that
// inserting it again would change.
//
// Value lists. The constructor with values, SetIntvls, HasIntvls and
// HasExactTheseIntvls take int values ended by -1, as in CIntvlSet(24, 0, 4, 7, -1).
// They are variadic templates that collect the values into an array and forward it
// to the ...FromList members below, so a list without its -1 simply ends after the
// last value and nothing is read past it. Each operation has its own end test:
//   - the constructor, SetIntvls and HasIntvls stop at the first value that is
//     negative or above 127 (the value read as an unsigned 32-bit number is above
//     127); that value is not used;
//   - the constructor and SetIntvls also stop once the set holds more than 127
//     intervals;
//   - HasExactTheseIntvls stops at the first negative value only: values above 127
//     are part of its list.
// Only integral values are accepted, and none that would narrow on conversion to int.
#ifndef TONVEX_INTVLSET_H
#define TONVEX_INTVLSET_H

#include "MySet.h"
#include "TonvexExport.h"

#include <cstddef>
#include <iosfwd>
#include <type_traits>

class TONVEX_API CIntvlSet {
public:
  using const_iterator = CMySet<int>::const_iterator;
  using size_type = CMySet<int>::size_type;

  /// An empty set with the given wrap interval.
  explicit CIntvlSet(int wrapIntvl) : WrapIntvl_(wrapIntvl) {}
  /// The given wrap interval, then the listed values inserted by the insertion rule
  /// (list ended by -1, see the header comment): CIntvlSet(12, 0, 4, 19, -1) holds
  /// {0, 4, 7}; CIntvlSet(24, 0, 200, 4, -1) holds {0}, since 200 ends the list.
  template <class... Rest>
  CIntvlSet(int wrapIntvl, int first, Rest... rest) : WrapIntvl_(wrapIntvl) {
    int const values[] = {first, CheckedListValue(rest)...};
    SetIntvlsFromList(values, sizeof values / sizeof values[0]);
  }

  /// Empties the set (the wrap interval is kept), then inserts the listed values as
  /// the constructor does.
  template <class... Rest>
  void SetIntvls(int first, Rest... rest) {
    int const values[] = {first, CheckedListValue(rest)...};
    SetIntvlsFromList(values, sizeof values / sizeof values[0]);
  }
  /// SetIntvls on an array: empties the set, then inserts values[0..count) by the
  /// insertion rule, ending early at the first value that is negative or above 127
  /// or once the set holds more than 127 intervals.
  void SetIntvlsFromList(int const* values, std::size_t count);

  /// Whether exactly i is a member (i is not folded). False on an empty set.
  bool HasIntvl(int i) const { return Intvls_.find(i) != Intvls_.end(); }
  /// Whether every listed value is a member (not folded). The list ends at the first
  /// value that is negative or above 127; an empty list (HasIntvls(-1)) is true.
  template <class... Rest>
  bool HasIntvls(int first, Rest... rest) const {
    int const values[] = {first, CheckedListValue(rest)...};
    return HasIntvlsFromList(values, sizeof values / sizeof values[0]);
  }
  /// HasIntvls on an array of count values (same end test).
  bool HasIntvlsFromList(int const* values, std::size_t count) const;

  /// Whether r, r + 12, r + 24, ... below the wrap interval holds a member, where
  /// r = i % 12 with the truncating remainder (a negative i gives a negative r, which
  /// is never a member, so -10 finds 2 and 14 but not 10). With wrap 24,
  /// HasIntvlInAnyOctave(2) is true for a set holding 2 or 14. Always false under a
  /// wrap interval of 0 or below, where the search has no room.
  bool HasIntvlInAnyOctave(int i) const;

  /// Whether the set consists of exactly the listed values (the list ends at the
  /// first negative value). Decided in these steps:
  ///   1. every listed value must be a member (unfolded), and the set non-empty
  ///      unless the list is;
  ///   2. the set's size must equal the number of listed values, duplicates counted;
  ///   3. the distinct listed values, ascending, must be the smallest members of the
  ///      set (operator== with them as the left operand).
  /// So {0, 4, 7} matches 0, 4, 7 in any order; {0, 4, 7, 11} does not match 0, 4, 7;
  /// and {0, 4, 7} also matches 0, 4, 4 (three values, and 0, 4 begin the set) but
  /// not 0, 7, 7. Allocates nothing for sets of up to 64 intervals.
  template <class... Rest>
  bool HasExactTheseIntvls(int first, Rest... rest) const {
    int const values[] = {first, CheckedListValue(rest)...};
    return HasExactTheseIntvlsFromList(values, sizeof values / sizeof values[0]);
  }
  /// HasExactTheseIntvls on an array of count values (same end test).
  bool HasExactTheseIntvlsFromList(int const* values, std::size_t count) const;

  /// Whether the set holds any interval other than 0, 3, 4, 7 and i: something beyond
  /// the stacked thirds of a triad and the one option i.
  bool HasOtherStackedThirdsOptionThan(int i) const;

  /// The n-th smallest interval, counting from 0. An n at or beyond the size gives
  /// -1, which no set holds.
  int Intvl(unsigned long n) const;

  /// The interval set of the n-th inversion, wrap interval 24: with base = the
  /// (n modulo size)-th smallest interval and span = the smallest multiple of 12, at
  /// least 12, not below the largest interval, each interval i becomes
  /// (span + i - base) modulo span. {0, 4, 7} gives {0, 3, 8} for n = 1, {0, 5, 9}
  /// for n = 2, {0, 4, 7} for n = 3; {0, 4, 7, 14} with n = 1 gives {0, 3, 10, 20}.
  /// A set of fewer than two intervals comes back as an exact copy, wrap interval
  /// included.
  CIntvlSet Inversion(unsigned long n) const;
  /// Replaces this set, wrap interval included, by Inversion(1).
  void Invert();

  // Single-value maintenance, for owners that keep a set up to date value by value
  // (the chord model's interval cache).

  /// Inserts one value by the insertion rule; returns whether the set grew.
  bool InsertIntvl(int value);
  /// Removes exactly this value (not folded); returns whether it was a member.
  bool EraseIntvl(int intvl);
  /// Removes every member from lo to hi inclusive (none when lo > hi).
  void EraseIntvlsFromTo(int lo, int hi);
  /// Removes all intervals; the wrap interval is kept.
  void Clear() { Intvls_.clear(); }
  /// Sets the wrap interval and folds the present members by the insertion rule
  /// under it, so that switching from 24 to 12 turns 14 into 2 (merging with a 2
  /// already there).
  void SetWrapIntvl(int wrapIntvl);

  int WrapIntvl() const { return WrapIntvl_; }
  size_type size() const { return Intvls_.size(); }
  bool empty() const { return Intvls_.empty(); }
  /// Iteration from the smallest to the largest interval.
  const_iterator begin() const { return Intvls_.begin(); }
  const_iterator end() const { return Intvls_.end(); }

  /// Diagnostic hook; prints nothing.
  void Trace() const {}

  /// Self-test of the insertion rule and the membership queries under the wrap
  /// intervals 1 to 48; true when every check passed.
  static bool AutoTest();

  /// One value of a variadic int list (here and in CChord's key number lists): only
  /// integral or enumeration types whose every value fits an int compile, so a long
  /// or a double in a list is an error rather than a silent cut.
  template <class T>
  static constexpr int CheckedListValue(T value) {
    constexpr bool fits =
        std::is_enum_v<T> ||
        (std::is_integral_v<T> && (std::is_signed_v<T> ? sizeof(T) <= sizeof(int) : sizeof(T) < sizeof(int)));
    static_assert(fits, "value lists take int values");
    return int{value};
  }

private:
  CMySet<int> Intvls_;
  int WrapIntvl_;
};

/// One-sided comparison, made for matching a set against one that may extend it:
/// true when a is empty; otherwise a's members and b's are walked side by side,
/// ascending, for as many steps as a has members, and the first differing pair gives
/// false (so does running out of b's members). Sizes and wrap intervals are not
/// compared: {0, 4} == {0, 4, 7} is true, {0, 4, 7} == {0, 4} is false.
TONVEX_API bool operator==(CIntvlSet const& a, CIntvlSet const& b);

/// "CIntvlSet: (" then " " and each interval, ascending, then " )":
/// "CIntvlSet: ( 0 4 7 )"; the empty set prints "CIntvlSet: ( )". No line end.
TONVEX_API std::ostream& operator<<(std::ostream& os, CIntvlSet const& set);

#endif
