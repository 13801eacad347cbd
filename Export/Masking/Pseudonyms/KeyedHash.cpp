// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Pseudonyms/KeyedHash.h"

#include <nettle/hmac.h>
#include <nettle/sha2.h>

namespace velmora {

struct KeyedHash::State {
    hmac_sha256_ctx context;
};

KeyedHash::KeyedHash(Bytes key) : _state(std::make_unique<State>()) {
    hmac_sha256_set_key(&_state->context, key.size(), key.data());
}

KeyedHash::~KeyedHash() = default;

KeyedHash::Digest KeyedHash::operator()(Bytes message) const {
    Digest digest{};
    hmac_sha256_update(&_state->context, message.size(), message.data());
    hmac_sha256_digest(&_state->context, digest.size(), digest.data()); // and begins again, with the same key
    return digest;
}

struct Hash::State {
    sha256_ctx context;
};

Hash::Hash() : _state(std::make_unique<State>()) {
    sha256_init(&_state->context);
}

Hash::~Hash() = default;

void Hash::add(Bytes bytes) {
    sha256_update(&_state->context, bytes.size(), bytes.data());
}

KeyedHash::Digest Hash::digest() {
    KeyedHash::Digest digest{};
    sha256_digest(&_state->context, digest.size(), digest.data());
    return digest;
}

} // namespace velmora
