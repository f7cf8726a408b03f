#include "Item.h"

#include "Registry.h"

RegisterItem::RegisterItem(Item item) {
    registeredItems().push_back(std::move(item));
}

std::vector<Item>& registeredItems() {
    static std::vector<Item> items;
    return items;
}
