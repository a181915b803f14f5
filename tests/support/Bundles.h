// SPDX-License-Identifier: Apache-2.0
// The compiled resource bundles of the tests: root, en, de and ja of the one bundle "zelvomsg".
#pragma once

namespace zelvo_test {

/// The directory that holds the bundle, for the Unicode library's data path.
constexpr const char *bundleDirectory = ZELVO_TEST_BUNDLES;
/// The bundle as a path that opens wherever the test runs.
constexpr const char *bundlePath = ZELVO_TEST_BUNDLES "/zelvomsg";

} // namespace zelvo_test
