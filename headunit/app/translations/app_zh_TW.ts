<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
<context>
    <name>AudioSources</name>
    <message>
        <source>Reading the disc…</source>
        <translation>正在讀取光碟…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>無光碟</translation>
    </message>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>Satellite</source>
        <translation>衛星</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>播放器</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>手機</translation>
    </message>
    <message numerus="yes">
        <source>%n track(s)</source>
        <translation>
            <numerusform>%n 首</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AudioSourcesPopup</name>
    <message>
        <source>Sources</source>
        <translation>音源</translation>
    </message>
</context>
<context>
    <name>CallChip</name>
    <message>
        <source>Show the call</source>
        <translation>顯示通話</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>正在撥號…</translation>
    </message>
</context>
<context>
    <name>ConnectionTransient</name>
    <message>
        <source>Vehicle connected</source>
        <translation>車輛已連線</translation>
    </message>
    <message>
        <source>No connection to the vehicle</source>
        <translation>未與車輛連線</translation>
    </message>
</context>
<context>
    <name>InputPanel</name>
    <message>
        <source>Nothing is typed now</source>
        <translation>目前沒有輸入</translation>
    </message>
</context>
<context>
    <name>Key</name>
    <message>
        <source>Shift</source>
        <translation>大寫</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
    <message>
        <source>Symbols</source>
        <translation>符號</translation>
    </message>
    <message>
        <source>Letters</source>
        <translation>字母</translation>
    </message>
    <message>
        <source>Next keyboard</source>
        <translation>下一個鍵盤</translation>
    </message>
    <message>
        <source>Write by hand</source>
        <translation>手寫</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>鍵盤</translation>
    </message>
    <message>
        <source>Hide keyboard</source>
        <translation>隱藏鍵盤</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>完成</translation>
    </message>
    <message>
        <source>Space</source>
        <translation>空格</translation>
    </message>
</context>
<context>
    <name>Launcher</name>
    <message>
        <source>Home</source>
        <translation>主畫面</translation>
    </message>
</context>
<context>
    <name>Market</name>
    <message>
        <source>%1 °F</source>
        <translation>%1&#xa0;°F</translation>
    </message>
    <message>
        <source>%1 °C</source>
        <translation>%1&#xa0;°C</translation>
    </message>
</context>
<context>
    <name>ModuleMarks</name>
    <message>
        <source>There is no such mark</source>
        <translation>沒有這樣的標記</translation>
    </message>
</context>
<context>
    <name>NowPlaying</name>
    <message>
        <source>Satellite</source>
        <translation>衛星</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>正在手機上播放</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>手機</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>曲目 %1</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>播放器</translation>
    </message>
</context>
<context>
    <name>NowPlayingCard</name>
    <message>
        <source>Previous</source>
        <translation>上一個</translation>
    </message>
    <message>
        <source>Sound on</source>
        <translation>取消靜音</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>靜音</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>下一個</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>音源</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>暫停</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>播放</translation>
    </message>
</context>
<context>
    <name>PopupCard</name>
    <message>
        <source>Close</source>
        <translation>關閉</translation>
    </message>
</context>
<context>
    <name>ProjectionScreen</name>
    <message>
        <source>Phone screen</source>
        <translation>手機投影</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>沒有投影中的手機</translation>
    </message>
    <message>
        <source>The phone on the cable draws here.</source>
        <translation>此處顯示以傳輸線連接的手機畫面。</translation>
    </message>
    <message>
        <source>The phone draws here, without cable.</source>
        <translation>此處顯示無線連接的手機畫面。</translation>
    </message>
    <message>
        <source>Call on the projected phone</source>
        <translation>投影中的手機正在通話</translation>
    </message>
</context>
<context>
    <name>Rail</name>
    <message>
        <source>Home</source>
        <translation>主畫面</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>返回</translation>
    </message>
    <message>
        <source>Phone screen</source>
        <translation>手機投影</translation>
    </message>
</context>
<context>
    <name>ScrollList</name>
    <message>
        <source>More when you have stopped</source>
        <translation>停車後查看更多</translation>
    </message>
</context>
<context>
    <name>SearchModel</name>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>Satellite</source>
        <translation>衛星</translation>
    </message>
</context>
<context>
    <name>SearchScreen</name>
    <message>
        <source>Search</source>
        <translation>搜尋</translation>
    </message>
    <message>
        <source>Contacts and stations</source>
        <translation>聯絡人與電台</translation>
    </message>
    <message>
        <source>Nothing is called that</source>
        <translation>沒有符合的名稱</translation>
    </message>
    <message>
        <source>Type a name, or write it by hand</source>
        <translation>輸入或手寫一個名稱</translation>
    </message>
</context>
<context>
    <name>StandbyScreen</name>
    <message>
        <source>Touch to switch on</source>
        <translation>輕觸以開機</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Search</source>
        <translation>搜尋</translation>
    </message>
</context>
<context>
    <name>SystemScreens</name>
    <message>
        <source>The head unit is switched off</source>
        <translation>系統已關閉</translation>
    </message>
    <message>
        <source>Valet mode is on already</source>
        <translation>代客泊車模式已開啟</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>沒有投影中的手機</translation>
    </message>
    <message>
        <source>This is not possible now</source>
        <translation>目前無法執行此操作</translation>
    </message>
</context>
<context>
    <name>TextField</name>
    <message>
        <source>Clear</source>
        <translation>清空</translation>
    </message>
    <message>
        <source>Not while driving</source>
        <translation>行駛中無法使用</translation>
    </message>
</context>
<context>
    <name>TurnChip</name>
    <message>
        <source>Show the map</source>
        <translation>顯示地圖</translation>
    </message>
</context>
<context>
    <name>TurnHint</name>
    <message>
        <source>There is no turn to show</source>
        <translation>沒有可顯示的轉彎提示</translation>
    </message>
</context>
<context>
    <name>Units</name>
    <message>
        <source>%1 m</source>
        <translation>%1 公尺</translation>
    </message>
    <message>
        <source>%1 km</source>
        <translation>%1 公里</translation>
    </message>
    <message>
        <source>%1 yd</source>
        <translation>%1 碼</translation>
    </message>
    <message>
        <source>%1 mi</source>
        <translation>%1 英里</translation>
    </message>
    <message>
        <source>%1 ft</source>
        <translation>%1 英尺</translation>
    </message>
    <message>
        <source>%1 min</source>
        <translation>%1 分鐘</translation>
    </message>
    <message>
        <source>%1 h %2 min</source>
        <translation>%1 小時 %2 分鐘</translation>
    </message>
</context>
<context>
    <name>ValetScreen</name>
    <message>
        <source>Valet mode</source>
        <translation>代客泊車模式</translation>
    </message>
    <message>
        <source>Personal data is hidden and the volume keys are locked.</source>
        <translation>個人資料已隱藏，音量鍵已鎖定。</translation>
    </message>
    <message>
        <source>Leave valet mode</source>
        <translation>退出代客泊車模式</translation>
    </message>
</context>
<context>
    <name>VoicePopup</name>
    <message>
        <source>Voice control</source>
        <translation>語音控制</translation>
    </message>
    <message>
        <source>Spoken message</source>
        <translation>語音播報</translation>
    </message>
    <message>
        <source>Voice control is not ready</source>
        <translation>語音控制尚未就緒</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>第 %1 步</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>停止</translation>
    </message>
</context>
<context>
    <name>VolumeTransient</name>
    <message>
        <source>Volume</source>
        <translation>音量</translation>
    </message>
    <message>
        <source>Volume of the voice</source>
        <translation>語音音量</translation>
    </message>
</context>
<context>
    <name>WritingPad</name>
    <message>
        <source>Write here</source>
        <translation>在此書寫</translation>
    </message>
</context>
</TS>
