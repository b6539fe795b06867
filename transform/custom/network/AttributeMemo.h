// What a network answered during one outermost query for attributes. Custom transformers that stand inside
// each other share their definitions: without this, a definition placed twice on each of n levels would be
// worked through 2^n times.
#pragma once

#include <transform/custom/CompoundTransformerNetwork.h>

struct CompoundTransformerNetwork::AttributeMemo {
  struct Key {
    QString output;
    QVector<AttributeSet> inputs;  // in the order of the ports
    QStringList values;            // of the parameters that references inside may take

    friend bool operator==(const Key& left, const Key& right) {
      return left.output == right.output && left.inputs == right.inputs && left.values == right.values;
    }
    friend uint qHash(const Key& key, uint seed = 0) {
      return ::qHash(key.output, seed) ^ ::qHash(key.inputs, seed) ^ ::qHash(key.values, seed + 1);
    }
  };

  quint64 query = 0;
  QHash<Key, AttributeSet> answers;
};
