#pragma once

#include <functional>

namespace kindrel::desktop {

/// Does the work in a thread of its own and comes back when it is done; meanwhile windows go on being drawn. Throws
/// what the work throws. The caller sees to it that nothing can be chosen twice.
void run_beside(const std::function<void()>& work);

} // namespace kindrel::desktop
