#ifndef _CT_DETAIL_VIEW_FACEBOOK_ITEM_H_
#define _CT_DETAIL_VIEW_FACEBOOK_ITEM_H_

#include "CtDetailViewGenlistItem.h"

#include <app_control.h>

// "View profile" of a person that comes from a social account: opens the
// profile in the social application.
class CtDetailViewFacebookItem : public CtDetailViewGenlistItem {
public:
	// A social profile as the contacts service stores it on a contact.
	struct SocialProfile {
		std::string appId;
		std::string operation;
		std::string uri;
		// "key:value" pairs separated by ",", each key and value Base64-encoded.
		std::string extraData;
	};

	explicit CtDetailViewFacebookItem(CtDetailDataBase* data);

	// Opens the first linked contact's first social profile.
	void openProfile();
	// The request that opens `profile`: a new handle the caller destroys,
	// null when it cannot be made.
	static app_control_h createLaunchRequest(const SocialProfile& profile);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_FACEBOOK; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "1line"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
	void onIconClicked(const char* touchPart) override;
	// The first linked contact's first profile; false when there is none.
	virtual bool readFirstProfile(SocialProfile& profile);

private:
	static void __iconClickedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
};

#endif
