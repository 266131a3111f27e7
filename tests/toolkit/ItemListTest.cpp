#include "toolkit/ItemList.h"

#include <curses.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "../render/CursesTestScreen.h"
#include "include/ColorNumbers.h"
#include "toolkit/InputItem.h"
#include "toolkit/LabelItem.h"
#include "toolkit/ScrollBar.h"
#include "toolkit/TextArea.h"
#include "toolkit/Window.h"

namespace {

using namespace Tulk;
using TulkTest::CellAt;

// A list of `rows` rows in a yellow window, with labels "item N".
class ItemListTest : public ::testing::Test {
 protected:
  void Build(int rows, int count) {
    parent_ = std::make_unique<Window>(0, 0, 30, rows, kYellow, kWhite);
    list_ = new ItemList(parent_.get(), 0, 0, 30, rows);
    items_.clear();
    for (int i = 0; i < count; ++i) {
      items_.push_back(std::make_unique<LabelItem>("item " + std::to_string(i)));
    }
  }
  std::vector<Item*> Pointers() {
    std::vector<Item*> pointers;
    for (auto& item : items_) {
      pointers.push_back(item.get());
    }
    return pointers;
  }
  std::string RowText(int row) {
    return TulkTest::RowText(list_->RowArea(row)->Curses(), 0).substr(0, 8);
  }
  std::pair<int, int> RowColors(int row) {
    TulkTest::CellInfo cell = CellAt(list_->RowArea(row)->Curses(), 0, 0);
    return {cell.background, cell.foreground};
  }

  TulkTest::CursesTestScreen screen_{40, 20};
  std::unique_ptr<Window> parent_;
  ItemList* list_ = nullptr;
  std::vector<std::unique_ptr<LabelItem>> items_;
};

TEST_F(ItemListTest, FirstEnabledFocusableItemBecomesCurrentAndOrdinalCountsFocusables) {
  Build(5, 5);
  items_[0]->SetFocusable(false);  // a heading row
  items_[1]->SetEnabled(false);
  list_->SetItems(Pointers());
  EXPECT_EQ(list_->CurrentIndex(), 2);
  EXPECT_EQ(list_->Ordinal(), 1);
}

TEST_F(ItemListTest, MovesSkipDisabledItemsAndStopAtBothEnds) {
  Build(5, 5);
  items_[2]->SetEnabled(false);
  items_[4]->SetEnabled(false);
  list_->SetItems(Pointers());
  EXPECT_FALSE(list_->MoveUp());
  EXPECT_EQ(list_->CurrentIndex(), 0);
  EXPECT_TRUE(list_->MoveDown());
  EXPECT_TRUE(list_->MoveDown());
  EXPECT_EQ(list_->CurrentIndex(), 3);
  EXPECT_EQ(list_->Ordinal(), 3);
  EXPECT_FALSE(list_->MoveDown());
  EXPECT_EQ(list_->CurrentIndex(), 3);
  EXPECT_TRUE(list_->MoveUp());
  EXPECT_EQ(list_->CurrentIndex(), 1);
  EXPECT_EQ(list_->Ordinal(), 1);
}

TEST_F(ItemListTest, MoreItemsThanRowsScrollsAndShowsTheBar) {
  Build(3, 6);
  list_->SetItems(Pointers());
  list_->Draw();
  ASSERT_TRUE(list_->Bar()->BlockRow().has_value());
  EXPECT_EQ(*list_->Bar()->BlockRow(), 0);
  EXPECT_EQ(CellAt(list_->Bar()->Curses(), 0, 0).text, "\u2588");
  EXPECT_EQ(CellAt(list_->Bar()->Curses(), 1, 0).text, "\u2593");

  for (int i = 0; i < 5; ++i) {
    list_->MoveDown();
  }
  EXPECT_EQ(list_->Top(), 3);
  EXPECT_EQ(list_->CursorRow(), 2);
  EXPECT_EQ(*list_->Bar()->BlockRow(), 2);
  EXPECT_EQ(RowText(0), "item 3  ");
  EXPECT_EQ(RowText(2), "item 5  ");

  list_->MoveUp();
  list_->MoveUp();
  list_->MoveUp();
  EXPECT_EQ(list_->Top(), 2);
  EXPECT_EQ(list_->CursorRow(), 0);
  EXPECT_EQ(RowText(0), "item 2  ");
}

TEST_F(ItemListTest, ExactlyAsManyItemsAsRowsShowsNoBar) {
  Build(3, 3);
  list_->SetItems(Pointers());
  list_->Draw();
  EXPECT_FALSE(list_->Bar()->BlockRow().has_value());
  for (int row = 0; row < 3; ++row) {
    EXPECT_EQ(CellAt(list_->Bar()->Curses(), row, 0).text, " ");
  }
}

TEST_F(ItemListTest, CurrentRowIsWhiteOnBlackOthersShowTheirItemColours) {
  Build(4, 3);
  items_[2]->SetEnabled(false);
  list_->SetItems(Pointers());
  list_->MoveDown();
  list_->Draw();
  EXPECT_EQ(RowColors(0), std::make_pair(kYellow, kBlack));
  EXPECT_EQ(RowColors(1), std::make_pair(kBlack, kWhite));
  EXPECT_EQ(RowColors(2), std::make_pair(kYellow, kDarkGrey));
  // The row beyond the items shows the list's own colours.
  EXPECT_EQ(RowColors(3), std::make_pair(kYellow, kWhite));
  EXPECT_EQ(RowText(3), "        ");
}

TEST_F(ItemListTest, SelectByOrdinalCountsFocusableItemsOnly) {
  Build(2, 5);
  items_[0]->SetFocusable(false);
  items_[3]->SetEnabled(false);
  list_->SetItems(Pointers());
  EXPECT_TRUE(list_->SelectByOrdinal(2));
  EXPECT_EQ(list_->CurrentIndex(), 3);
  EXPECT_EQ(list_->Top(), 2);
  EXPECT_FALSE(list_->SelectByOrdinal(4));
  EXPECT_EQ(list_->CurrentIndex(), 3);
}

TEST_F(ItemListTest, ListWithoutSelectableItemsHasNoCurrentRow) {
  Build(3, 2);
  items_[0]->SetEnabled(false);
  items_[1]->SetFocusable(false);
  list_->SetItems(Pointers());
  EXPECT_EQ(list_->Current(), nullptr);
  EXPECT_FALSE(list_->MoveDown());
  list_->Draw();
  EXPECT_EQ(RowColors(0), std::make_pair(kYellow, kDarkGrey));
}

TEST_F(ItemListTest, InputFieldTurnsPristineWhenFocusMovesAwayAndBack) {
  Build(3, 0);
  InputItem name("Name:", "root", 10);
  InputItem other("Other:", "", 10);
  list_->SetItems({&name, &other});
  list_->Draw();
  name.HandleKey(KEY_END);
  ASSERT_FALSE(name.Field().pristine);
  list_->MoveDown();
  list_->MoveUp();
  EXPECT_TRUE(name.Field().pristine);
  name.HandleKey('x');
  EXPECT_EQ(name.Value(), "x");
}

}  // namespace
