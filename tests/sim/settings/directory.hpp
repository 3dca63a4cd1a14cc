// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/support/files.hpp"

namespace sim::test {

using ::test::content_of;
using ::test::put_content;
using ::test::TemporaryDirectory;

} // namespace sim::test
