#pragma once

namespace efl_answers {

/// Under this name a naviframe has the item whose pop EFL refused, as it was still moving in; it goes when it has come
/// to rest.
inline constexpr char refusedPopKey[] = "efl_answers::refusedPop";

}  // namespace efl_answers
