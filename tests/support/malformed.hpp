// SPDX-License-Identifier: Apache-2.0
// Bodies that are not what a decoder expects.
#pragma once

#include "tests/support/variant.hpp"

#include <string>
#include <utility>
#include <vector>

namespace test {

struct Malformed {
    std::string type; // empty: no body at all
    Variant body;
};

// Every shape of a varied lot beside this one.
inline std::vector<Malformed> malformed_for(const std::string &type) {
    const std::pair<const char *, const char *> shapes[] = {
        {"", ""},
        {"(i)", "(1,)"},
        {"(u)", "(1,)"},
        {"(x)", "(1,)"},
        {"(n)", "(1,)"},
        {"(y)", "(1,)"},
        {"(b)", "(true,)"},
        {"(d)", "(1.0,)"},
        {"(s)", "('1',)"},
        {"(v)", "(<1>,)"},
        {"(o)", "('/a',)"},
        {"((i))", "((1,),)"},
        {"(ai)", "([1],)"},
        {"(as)", "(['1'],)"},
        {"(a{sv})", "({'a': <1>},)"},
        {"(aa{sv})", "([{'a': <1>}],)"},
        {"(ii)", "(1, 2)"},
        {"(uu)", "(1, 2)"},
        {"(ib)", "(1, true)"},
        {"(is)", "(1, '2')"},
        {"(iii)", "(1, 2, 3)"},
        {"(ibi)", "(1, true, 3)"},
        {"(iis)", "(1, 2, '3')"},
        {"(iio)", "(1, 2, '/3')"},
        {"(iiay)", "(1, 2, [0x33])"},
        {"(ibs)", "(1, true, '3')"},
        {"(bui)", "(true, 2, 3)"},
        {"(iui)", "(1, 2, 3)"},
        {"(bii)", "(true, 2, 3)"},
        {"(iiii)", "(1, 2, 3, 4)"},
        {"(iuii)", "(1, 2, 3, 4)"},
        {"(iiui)", "(1, 2, 3, 4)"},
        {"(isii)", "(1, 'aGVsbG8=', 3, 4)"},
        {"(xsii)", "(1, 'aGVsbG8=', 3, 4)"},
        {"(isi)", "(1, 'aGVsbG8=', 3)"},
        {"(iayii)", "(1, [0x32], 3, 4)"},
        {"(buuiii)", "(true, 2, 3, 4, 5, 6)"},
        {"(iuuiii)", "(1, 2, 3, 4, 5, 6)"},
        {"(buuiiii)", "(true, 2, 3, 4, 5, 6, 0)"},
        {"(iiisii)", "(1, 2, 3, 'aGVsbG8=', 5, 6)"},
        {"(iiisxi)", "(1, 2, 3, 'aGVsbG8=', 5, 6)"},
        {"(iiisi)", "(1, 2, 3, 'aGVsbG8=', 5)"},
        {"(iiiayii)", "(1, 2, 3, [0x34], 5, 6)"},
        {"(ibbi)", "(1, true, true, 4)"},
        {"(iiis)", "(1, 2, 3, '4')"},
        {"(iibsb)", "(1, 2, true, '4', true)"},
        {"(ibbsb)", "(1, true, true, '4', true)"},
        {"(ivivi)", "(1, <[1]>, 1, <['1']>, 1)"},
        {"(ivivu)", "(1, <[1]>, 1, <['1']>, 1)"},
        {"(iaiiasi)", "(1, [1], 1, ['1'], 1)"},
        {"(isisssssb)", "(1, '2', 3, '4', '5', '6', '7', '8', true)"},
        {"(isissssb)", "(1, '2', 3, '4', '5', '6', '7', true)"},
        {"(isisssssbi)", "(1, '2', 3, '4', '5', '6', '7', '8', true, 9)"},
        {"(isissssss)", "(1, '2', 3, '4', '5', '6', '7', '8', '9')"},
        {"(iss)", "(1, '2', '3')"},
        {"(iv)", "(1, <{'subject': <'3'>}>)"},
        {"(ia{sv})", "(1, {'subject': <'3'>})"},
        {"(ia{ss})", "(1, {'subject': '3'})"},
        {"(ivviv)", "(1, <2>, <3>, 4, <5>)"},
        {"(ia{sv}a{sv}ia{sv})", "(1, {}, {}, 4, {})"},
        {"(ivsiiv)", "(1, <2>, '3', 4, 5, <6>)"},
        {"(ivsissvsiiiv)", "(1, <2>, '3', 4, '5', '6', <7>, '8', 9, 10, 11, <12>)"},
        {"(ivsissvsiiv)", "(1, <2>, '3', 4, '5', '6', <7>, '8', 9, 10, <11>)"},
        {"(bbiivv)", "(true, true, 3, 4, <[5]>, <[6]>)"},
        {"(bbiiaiai)", "(true, true, 3, 4, [5], [6])"},
        {"(bbbiivv)", "(true, true, true, 4, 5, <[6]>, <[7]>)"},
        {"(ivisisiiis)", "(1, <[2]>, 3, '4', 5, '6', 7, 8, 9, '10')"},
        {"(iaiisisiiis)", "(1, [2], 3, '4', 5, '6', 7, 8, 9, '10')"},
        {"(ivisisiisi)", "(1, <[2]>, 3, '4', 5, '6', 7, 8, '9', 10)"},
        {"(iibsbvbvv)", "(1, 2, true, '4', true, <[6]>, true, <[8]>, <{'uri': <'9'>}>)"},
        {"(iibsbvbva{sv})", "(1, 2, true, '4', true, <[6]>, true, <[8]>, {'uri': <'9'>})"},
        {"(bbbbssssssiivv)",
         "(true, true, true, true, '5', '6', '7', '8', '9', '10', 11, 12, <[13]>, <[14]>)"},
        {"(bbbbsssssiivv)",
         "(true, true, true, true, '5', '6', '7', '8', '9', 10, 11, <[12]>, <[13]>)"}};
    std::vector<Malformed> others;
    for (const auto &[shape, value] : shapes)
        if (shape != type)
            others.push_back({shape, parse(shape, value)});
    return others;
}

} // namespace test
