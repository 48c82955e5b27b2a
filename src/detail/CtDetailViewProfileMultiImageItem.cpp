#include "CtDetailViewProfileMultiImageItem.h"

CtDetailViewProfileMultiImageItem::CtDetailViewProfileMultiImageItem(CtDetailViewItemOwner* owner,
		CtDetailDataBase* data, bool isLowSize)
	: CtDetailViewMultiImageItem(owner, data, isLowSize)
{
}
