// SPDX-License-Identifier: Apache-2.0
#pragma once

/// The short message codec: 3GPP TS 23.040 messages with the TS 23.038 alphabets.
///
/// Sending a text of any length:
///
///     auto text = tpdu::segment("Grüße", {.reference = 7});
///     auto to = tpdu::number_address("+15550101");
///     for (auto &part : text->parts) {
///         tpdu::Submit submit;
///         submit.destination = *to;
///         submit.data_coding = tpdu::data_coding_for(text->alphabet);
///         submit.user_data = part;
///         auto octets = tpdu::encode(submit);
///     }
///
/// Receiving:
///
///     auto deliver = tpdu::decode_deliver(octets);
///     if (deliver)
///         if (auto message = reassembler.add(*deliver))
///             show(to_text(message->sender), *message->text());
///
/// Every function that can fail returns a Result; test it before use, as these lines do not.

#include "tools/tpdu/address.hpp"
#include "tools/tpdu/alphabet.hpp"
#include "tools/tpdu/concatenation.hpp"
#include "tools/tpdu/data_coding.hpp"
#include "tools/tpdu/octets.hpp"
#include "tools/tpdu/pdu.hpp"
#include "tools/tpdu/result.hpp"
#include "tools/tpdu/status.hpp"
#include "tools/tpdu/timestamp.hpp"
#include "tools/tpdu/user_data.hpp"
#include "tools/tpdu/validity.hpp"
