#pragma once

namespace marlowbeck {

/// The one sorting pass of all lists, over places 1 to `count`.
///
/// `in_order(j, k)` is the list's own test of the entry at place j against that at place k, k > j;
/// `swap(j, k)` exchanges two entries in every parallel table. The pass is not stable: where equal
/// entries end up follows from its steps and from whether the test calls equal entries in order,
/// and users see that order, so nothing else may take its place.
template <typename InOrder, typename Swap>
void GapSort(int count, InOrder in_order, Swap swap) {
  for (int gap = count / 2; gap >= 1; gap /= 2) {
    for (int i = gap; i <= count - 1; ++i) {
      for (int j = i - gap + 1; j >= 1; j -= gap) {
        if (in_order(j, j + gap)) break;
        swap(j, j + gap);
      }
    }
  }
}

}  // namespace marlowbeck
