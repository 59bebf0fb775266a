#include "store_interface/records/part_attributes/bme_MapPropertyArray.h"

cow_List<int> bme_MapPropertyArray::ElementIds(int key) const {
    const cow_List<bme_Property>& group = ConstGet(key);
    cow_List<int> labels{cow_ListConstruct(group.Length())};
    for (int i = 0; i < group.Length(); ++i) labels.Append(group.UncheckedConstGet(i).elementLabel);
    return labels;
}
