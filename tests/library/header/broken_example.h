// SPDX-License-Identifier: Apache-2.0
/**
 * What the test of the examples must find: the second of two does not compile.
 *
 * @code{.c}
 * int sound(void) {
 *     return 0;
 * }
 * @endcode
 *
 * @code{.c}
 * int broken(void) {
 *     return nowhere;
 * }
 * @endcode
 */
