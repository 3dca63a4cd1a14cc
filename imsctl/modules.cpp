// SPDX-License-Identifier: Apache-2.0
// The one place that knows all modules. A new one takes a line here, a module.hpp of its own, and a
// section in docs/imsctl.md.
#include "imsctl/modules.hpp"

#include "imsctl/call/module.hpp"
#include "imsctl/group/module.hpp"
#include "imsctl/line/general_verbs.hpp"
#include "imsctl/ptt/module.hpp"
#include "imsctl/registration/module.hpp"
#include "imsctl/settings/module.hpp"
#include "imsctl/sms/module.hpp"
#include "imsctl/ss/module.hpp"
#include "imsctl/vt/module.hpp"

namespace imsctl {

Catalogue all_modules() {
    // The help shows their verbs in this order.
    const Module modules[] = {
        call_module(), registration_module(), sms_module(), ss_module(),      settings_module(),
        ptt_module(),  group_module(),        vt_module(),  general_module(),
    };
    return Catalogue(modules);
}

} // namespace imsctl
