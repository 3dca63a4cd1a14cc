// SPDX-License-Identifier: Apache-2.0
// A target needs a source to have precompiled headers, which the tests of the programs share.
