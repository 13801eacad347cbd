// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class Catalogue;

/// Enters what is known of the trees that serialized-object basebands send. They name their own leaves, so
/// that this is no limit: it is what tells levels, identities and states among them.
void describeKnownFields(Catalogue& catalogue);

} // namespace velmora
