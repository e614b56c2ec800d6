<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fi">
<context>
    <name></name>
    <message id="quorvanepelkan-bt-accept">
        <source>Accept</source>
        <extracomment>Button that accepts a dialog</extracomment>
        <translation>Hyväksy</translation>
    </message>
    <message id="quorvanepelkan-bt-cancel">
        <source>Cancel</source>
        <extracomment>Button that closes a dialog without accepting it</extracomment>
        <translation>Peruuta</translation>
    </message>
    <message id="quorvanepelkan-bt-scroll_to_bottom">
        <source>Scroll to the bottom</source>
        <extracomment>Accessible name of the button that takes a long list to its end</extracomment>
        <translation>Vieritä loppuun</translation>
    </message>
    <message id="quorvanepelkan-bt-scroll_to_top">
        <source>Scroll to the top</source>
        <extracomment>Accessible name of the button that takes a long list to its start</extracomment>
        <translation>Vieritä alkuun</translation>
    </message>
    <message id="quorvanepelkan-bytes" numerus="yes">
        <source>%n bytes</source>
        <extracomment>File size in bytes</extracomment>
        <translation>
            <numerusform>%n tavu</numerusform>
            <numerusform>%n tavua</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-date_format_full">
        <source>cccc, d MMMM yyyy</source>
        <extracomment>Full date pattern; cccc is the weekday</extracomment>
        <translation>cccc d. MMMM yyyy</translation>
    </message>
    <message id="quorvanepelkan-date_format_full_without_year">
        <source>cccc, d MMMM</source>
        <extracomment>Full date pattern without the year; cccc is the weekday</extracomment>
        <translation>cccc d. MMMM</translation>
    </message>
    <message id="quorvanepelkan-date_format_long">
        <source>d MMMM yyyy</source>
        <extracomment>Long date pattern; cccc is the weekday</extracomment>
        <translation>d. MMMM yyyy</translation>
    </message>
    <message id="quorvanepelkan-date_format_medium">
        <source>d MMM yyyy</source>
        <extracomment>Medium date pattern</extracomment>
        <translation>d.M.yyyy</translation>
    </message>
    <message id="quorvanepelkan-days" numerus="yes">
        <source>%n days ago</source>
        <extracomment>Time elapsed in days</extracomment>
        <translation>
            <numerusform>%n päivä sitten</numerusform>
            <numerusform>%n päivää sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-days-future" numerus="yes">
        <source>in %n days</source>
        <extracomment>Time until, in days</extracomment>
        <translation>
            <numerusform>%n päivän päästä</numerusform>
            <numerusform>%n päivän päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-days-future-short" numerus="yes">
        <source>in %n d</source>
        <extracomment>Time until, in days, short</extracomment>
        <translation>
            <numerusform>%n pv päästä</numerusform>
            <numerusform>%n pv päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-days-short" numerus="yes">
        <source>%n d ago</source>
        <extracomment>Time elapsed in days, short</extracomment>
        <translation>
            <numerusform>%n pv sitten</numerusform>
            <numerusform>%n pv sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-duration_long_format">
        <source>h:mm:ss</source>
        <extracomment>Duration pattern with hours</extracomment>
        <translation>h.mm.ss</translation>
    </message>
    <message id="quorvanepelkan-duration_short_format">
        <source>m:ss</source>
        <extracomment>Duration pattern without hours</extracomment>
        <translation>m.ss</translation>
    </message>
    <message id="quorvanepelkan-formatShortDate">
        <source>%1 %3</source>
        <extracomment>Day (%1) and month: numeric (%2) or abbreviated name (%3)</extracomment>
        <translation>%1.%2.</translation>
    </message>
    <message id="quorvanepelkan-formatTimepoint">
        <source>%2, %1</source>
        <extracomment>Time (%1) on a date or day (%2)</extracomment>
        <translation>%2 klo %1</translation>
    </message>
    <message id="quorvanepelkan-gigabytes">
        <source>%1 GB</source>
        <extracomment>File size in gigabytes</extracomment>
        <translation>%1 Gt</translation>
    </message>
    <message id="quorvanepelkan-he-back">
        <source>Back</source>
        <extracomment>Page header hint for going back to the previous page</extracomment>
        <translation>Takaisin</translation>
    </message>
    <message id="quorvanepelkan-hours" numerus="yes">
        <source>%n hours ago</source>
        <extracomment>Time elapsed in hours</extracomment>
        <translation>
            <numerusform>%n tunti sitten</numerusform>
            <numerusform>%n tuntia sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-hours-future" numerus="yes">
        <source>in %n hours</source>
        <extracomment>Time until, in hours</extracomment>
        <translation>
            <numerusform>%n tunnin päästä</numerusform>
            <numerusform>%n tunnin päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-hours-future-short" numerus="yes">
        <source>in %n h</source>
        <extracomment>Time until, in hours, short</extracomment>
        <translation>
            <numerusform>%n t päästä</numerusform>
            <numerusform>%n t päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-hours-short" numerus="yes">
        <source>%n h ago</source>
        <extracomment>Time elapsed in hours, short</extracomment>
        <translation>
            <numerusform>%n t sitten</numerusform>
            <numerusform>%n t sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-kilobytes">
        <source>%1 kB</source>
        <extracomment>File size in kilobytes</extracomment>
        <translation>%1 kt</translation>
    </message>
    <message id="quorvanepelkan-la-no-items">
        <source>No items</source>
        <extracomment>Placeholder of an empty list</extracomment>
        <translation>Ei kohteita</translation>
    </message>
    <message id="quorvanepelkan-la-pull_down_menu">
        <source>Pull-down menu</source>
        <extracomment>Accessible name of the menu above a list, opened by pulling the list down</extracomment>
        <translation>Alasvetovalikko</translation>
    </message>
    <message id="quorvanepelkan-la-push_up_menu">
        <source>Push-up menu</source>
        <extracomment>Accessible name of the menu below a list, opened by pushing the list up past its end</extracomment>
        <translation>Ylöstyöntövalikko</translation>
    </message>
    <message id="quorvanepelkan-la-remorse">
        <source>In %1 s, tap to cancel</source>
        <extracomment>Countdown before an action that can still be cancelled; %1 is the number of seconds left</extracomment>
        <translation>%1 s kuluttua, peru napauttamalla</translation>
    </message>
    <message id="quorvanepelkan-la-remorse_action">
        <source>%1 in %2 s, tap to cancel</source>
        <extracomment>Countdown before an action that can still be cancelled; %1 is what will happen (&quot;Deleting&quot;), %2 the number of seconds left</extracomment>
        <translation>%1 %2 s kuluttua, peru napauttamalla</translation>
    </message>
    <message id="quorvanepelkan-megabytes">
        <source>%1 MB</source>
        <extracomment>File size in megabytes</extracomment>
        <translation>%1 Mt</translation>
    </message>
    <message id="quorvanepelkan-minutes" numerus="yes">
        <source>%n minutes ago</source>
        <extracomment>Time elapsed in minutes</extracomment>
        <translation>
            <numerusform>%n minuutti sitten</numerusform>
            <numerusform>%n minuuttia sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-minutes-future" numerus="yes">
        <source>in %n minutes</source>
        <extracomment>Time until, in minutes</extracomment>
        <translation>
            <numerusform>%n minuutin päästä</numerusform>
            <numerusform>%n minuutin päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-minutes-future-short" numerus="yes">
        <source>in %n min</source>
        <extracomment>Time until, in minutes, short</extracomment>
        <translation>
            <numerusform>%n min päästä</numerusform>
            <numerusform>%n min päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-minutes-short" numerus="yes">
        <source>%n min ago</source>
        <extracomment>Time elapsed in minutes, short</extracomment>
        <translation>
            <numerusform>%n min sitten</numerusform>
            <numerusform>%n min sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-monthname_april_standalone">
        <source>April</source>
        <extracomment>Month name on its own</extracomment>
        <translation>huhtikuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_april_standalone_capitalized">
        <source>April</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Huhtikuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_april_standalone_short">
        <source>Apr</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>huhti</translation>
    </message>
    <message id="quorvanepelkan-monthname_august_standalone">
        <source>August</source>
        <extracomment>Month name on its own</extracomment>
        <translation>elokuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_august_standalone_capitalized">
        <source>August</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Elokuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_august_standalone_short">
        <source>Aug</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>elo</translation>
    </message>
    <message id="quorvanepelkan-monthname_december_standalone">
        <source>December</source>
        <extracomment>Month name on its own</extracomment>
        <translation>joulukuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_december_standalone_capitalized">
        <source>December</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Joulukuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_december_standalone_short">
        <source>Dec</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>joulu</translation>
    </message>
    <message id="quorvanepelkan-monthname_february_standalone">
        <source>February</source>
        <extracomment>Month name on its own</extracomment>
        <translation>helmikuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_february_standalone_capitalized">
        <source>February</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Helmikuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_february_standalone_short">
        <source>Feb</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>helmi</translation>
    </message>
    <message id="quorvanepelkan-monthname_january_standalone">
        <source>January</source>
        <extracomment>Month name on its own</extracomment>
        <translation>tammikuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_january_standalone_capitalized">
        <source>January</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Tammikuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_january_standalone_short">
        <source>Jan</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>tammi</translation>
    </message>
    <message id="quorvanepelkan-monthname_july_standalone">
        <source>July</source>
        <extracomment>Month name on its own</extracomment>
        <translation>heinäkuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_july_standalone_capitalized">
        <source>July</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Heinäkuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_july_standalone_short">
        <source>Jul</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>heinä</translation>
    </message>
    <message id="quorvanepelkan-monthname_june_standalone">
        <source>June</source>
        <extracomment>Month name on its own</extracomment>
        <translation>kesäkuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_june_standalone_capitalized">
        <source>June</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Kesäkuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_june_standalone_short">
        <source>Jun</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>kesä</translation>
    </message>
    <message id="quorvanepelkan-monthname_march_standalone">
        <source>March</source>
        <extracomment>Month name on its own</extracomment>
        <translation>maaliskuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_march_standalone_capitalized">
        <source>March</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Maaliskuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_march_standalone_short">
        <source>Mar</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>maalis</translation>
    </message>
    <message id="quorvanepelkan-monthname_may_standalone">
        <source>May</source>
        <extracomment>Month name on its own</extracomment>
        <translation>toukokuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_may_standalone_capitalized">
        <source>May</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Toukokuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_may_standalone_short">
        <source>May</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>touko</translation>
    </message>
    <message id="quorvanepelkan-monthname_november_standalone">
        <source>November</source>
        <extracomment>Month name on its own</extracomment>
        <translation>marraskuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_november_standalone_capitalized">
        <source>November</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Marraskuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_november_standalone_short">
        <source>Nov</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>marras</translation>
    </message>
    <message id="quorvanepelkan-monthname_october_standalone">
        <source>October</source>
        <extracomment>Month name on its own</extracomment>
        <translation>lokakuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_october_standalone_capitalized">
        <source>October</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Lokakuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_october_standalone_short">
        <source>Oct</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>loka</translation>
    </message>
    <message id="quorvanepelkan-monthname_september_standalone">
        <source>September</source>
        <extracomment>Month name on its own</extracomment>
        <translation>syyskuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_september_standalone_capitalized">
        <source>September</source>
        <extracomment>Month name on its own, capitalised</extracomment>
        <translation>Syyskuu</translation>
    </message>
    <message id="quorvanepelkan-monthname_september_standalone_short">
        <source>Sep</source>
        <extracomment>Abbreviated month name</extracomment>
        <translation>syys</translation>
    </message>
    <message id="quorvanepelkan-months" numerus="yes">
        <source>%n months ago</source>
        <extracomment>Time elapsed in months</extracomment>
        <translation>
            <numerusform>%n kuukausi sitten</numerusform>
            <numerusform>%n kuukautta sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-months-future" numerus="yes">
        <source>in %n months</source>
        <extracomment>Time until, in months</extracomment>
        <translation>
            <numerusform>%n kuukauden päästä</numerusform>
            <numerusform>%n kuukauden päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-months-future-short" numerus="yes">
        <source>in %n mo</source>
        <extracomment>Time until, in months, short</extracomment>
        <translation>
            <numerusform>%n kk päästä</numerusform>
            <numerusform>%n kk päästä</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-months-short" numerus="yes">
        <source>%n mo ago</source>
        <extracomment>Time elapsed in months, short</extracomment>
        <translation>
            <numerusform>%n kk sitten</numerusform>
            <numerusform>%n kk sitten</numerusform>
        </translation>
    </message>
    <message id="quorvanepelkan-now">
        <source>now</source>
        <extracomment>Relative time of less than a minute</extracomment>
        <translation>nyt</translation>
    </message>
    <message id="quorvanepelkan-older">
        <source>Older</source>
        <extracomment>Section of items more than a week old</extracomment>
        <translation>Vanhemmat</translation>
    </message>
    <message id="quorvanepelkan-terabytes">
        <source>%1 TB</source>
        <extracomment>File size in terabytes</extracomment>
        <translation>%1 Tt</translation>
    </message>
    <message id="quorvanepelkan-time_format_short_12h">
        <source>h:mm AP</source>
        <extracomment>Short time pattern, 12-hour clock</extracomment>
        <translation>h:mm AP</translation>
    </message>
    <message id="quorvanepelkan-time_format_short_24h">
        <source>hh:mm</source>
        <extracomment>Short time pattern, 24-hour clock</extracomment>
        <translation>H.mm</translation>
    </message>
    <message id="quorvanepelkan-time_value_twelve_hours">
        <source>h:mm AP</source>
        <extracomment>Time pattern, 12-hour clock</extracomment>
        <translation>h:mm AP</translation>
    </message>
    <message id="quorvanepelkan-time_value_twentyfour_hours">
        <source>hh:mm</source>
        <extracomment>Time pattern, 24-hour clock</extracomment>
        <translation>H.mm</translation>
    </message>
    <message id="quorvanepelkan-weekday_friday_standalone">
        <source>Friday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>perjantai</translation>
    </message>
    <message id="quorvanepelkan-weekday_friday_standalone_capitalized">
        <source>Friday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Perjantai</translation>
    </message>
    <message id="quorvanepelkan-weekday_monday_standalone">
        <source>Monday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>maanantai</translation>
    </message>
    <message id="quorvanepelkan-weekday_monday_standalone_capitalized">
        <source>Monday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Maanantai</translation>
    </message>
    <message id="quorvanepelkan-weekday_saturday_standalone">
        <source>Saturday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>lauantai</translation>
    </message>
    <message id="quorvanepelkan-weekday_saturday_standalone_capitalized">
        <source>Saturday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Lauantai</translation>
    </message>
    <message id="quorvanepelkan-weekday_sunday_standalone">
        <source>Sunday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>sunnuntai</translation>
    </message>
    <message id="quorvanepelkan-weekday_sunday_standalone_capitalized">
        <source>Sunday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Sunnuntai</translation>
    </message>
    <message id="quorvanepelkan-weekday_thursday_standalone">
        <source>Thursday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>torstai</translation>
    </message>
    <message id="quorvanepelkan-weekday_thursday_standalone_capitalized">
        <source>Thursday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Torstai</translation>
    </message>
    <message id="quorvanepelkan-weekday_tuesday_standalone">
        <source>Tuesday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>tiistai</translation>
    </message>
    <message id="quorvanepelkan-weekday_tuesday_standalone_capitalized">
        <source>Tuesday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Tiistai</translation>
    </message>
    <message id="quorvanepelkan-weekday_wednesday_standalone">
        <source>Wednesday</source>
        <extracomment>Weekday name on its own</extracomment>
        <translation>keskiviikko</translation>
    </message>
    <message id="quorvanepelkan-weekday_wednesday_standalone_capitalized">
        <source>Wednesday</source>
        <extracomment>Weekday name on its own, capitalised</extracomment>
        <translation>Keskiviikko</translation>
    </message>
    <message id="quorvanepelkan-yesterday">
        <source>Yesterday</source>
        <extracomment>Section or time of the previous day</extracomment>
        <translation>Eilen</translation>
    </message>
    <message id="quorvanepelkan-la-password">
        <source>Password</source>
        <extracomment>Label under a password field</extracomment>
        <translation>Salasana</translation>
    </message>
    <message id="quorvanepelkan-la-show-password">
        <source>Show password</source>
        <extracomment>Accessible name of the button beside a password field that shows the text</extracomment>
        <translation>Näytä salasana</translation>
    </message>
    <message id="quorvanepelkan-la-clear-search">
        <source>Clear search</source>
        <extracomment>Accessible name of the button in a search field that clears the text</extracomment>
        <translation>Tyhjennä haku</translation>
    </message>
    <message id="quorvanepelkan-ph-search">
        <source>Search</source>
        <extracomment>Placeholder of an empty search field</extracomment>
        <translation>Hae</translation>
    </message>
</context>
</TS>
