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

#include "tpdu/address.hpp"
#include "tpdu/alphabet.hpp"
#include "tpdu/concatenation.hpp"
#include "tpdu/data_coding.hpp"
#include "tpdu/octets.hpp"
#include "tpdu/pdu.hpp"
#include "tpdu/result.hpp"
#include "tpdu/status.hpp"
#include "tpdu/timestamp.hpp"
#include "tpdu/user_data.hpp"
#include "tpdu/validity.hpp"
