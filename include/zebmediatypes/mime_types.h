// MIME type constants
//
// The media type strings that importers, exporters and the host spell
// identically: 331 constants, 31 application, 168 audio, 33 image, 56 text and
// 43 video types. Each is a constant-initialized ImmutableString, readable from
// any static initializer of any file and from any thread without a lock.
//
// Names are kMimeType_<Type>_<Format>; further spellings of one format carry
// one more trailing underscore each (kMimeType_Audio_MP3 ... kMimeType_Audio_MP3________).
// The texts are kept exactly as peers compare them, irregular ones included
// (kMimeType_Audio_RealAudio_ is "audio/application/x-pn-realaudio"); texts with
// parameters keep the single space after the semicolon.
#pragma once

#include <zebcore/immutable_string.h>

#include <cstddef>

namespace zebmediatypes {

// Application (31 constants).
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_7Zip =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-7z-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_Ace =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-ace-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_Arj =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-arj");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_Arj_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-arj-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_B6Z =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-b6z-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_BZip2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-bzip2");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_Cab =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/vnd.ms-cab-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_DGCA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-dgc-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_GTar =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-gtar");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_GZip =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/gzip");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_GZip_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/gzip-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_GZip__ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/gzipped");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_GZip___ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-gzip");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_GZip____ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-gzip-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_JAR =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/java-archive");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_LHA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-lha");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_LHARC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-lharc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_LZH =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-lzh-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_Lzip =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-lzip");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_LZMA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-lzma");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_OctetStream =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/octet-stream");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_RAR =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-rar-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_TAR =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_TAR_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-tar");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_UC2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-uc2-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_URL =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/internet-shortcut");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_URL_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-url");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_XZ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-xz");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_ZIP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/zip");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_ZIP_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/x-zip-compressed");
inline constexpr zebcore::utility::ImmutableString kMimeType_Application_ZLIB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("application/zlib");

// Audio (168 constants).
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_32kADPCM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/32kadpcm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_3G2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/3gpp2");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_3GP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/3gpp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_8SVX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/8svx");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_8SVX_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-8svx");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AAC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-aac");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AC3 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/ac3");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ADBCM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-adbcm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ADPCM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/adpcm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AIFF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/aiff");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AIFF_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-aiff");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AMR =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/amr");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AMRWB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/amr-wb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AMRWB_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-amr-wb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AMRWBPlus =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/amr-wb+");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ASC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/asc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ASF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/asf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Audible =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/audible");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Audible_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-pn-audibleaudio");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_AVI =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/avi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_BV16 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/bv16");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_BV32 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/bv32");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ClearMode =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/clearmode");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_CN =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/cn");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_CreativeVoice =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-voc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Dat12 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/dat12");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_DECADBCM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-dec-adbcm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_DECBASIC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-dec-basic");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_DLS =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/dls");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_DVI4 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/dvi4");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EAC3 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/eac3");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRC0 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrc0");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRC1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrc1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrcb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCB0 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrcb0");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCB1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrcb1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCQCP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrc-qcp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCWB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrcwb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCWB0 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrcwb0");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_EVRCWB1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/evrcwb1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Example =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/example");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_FLAC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/flac");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_FLAC_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-flac");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G719 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g719");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G722 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g722");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G7221 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g7221");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G723 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g723");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G726_16 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g726-16");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G726_24 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g726-24");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G726_32 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g726-32");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G726_40 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g726-40");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G728 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g728");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G729 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g729");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G7291 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g7291");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G729D =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g729d");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_G729E =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/g729e");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_GSM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/gsm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_GSM_EFR =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/gsm-efr");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_IT =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/it");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_L16 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/l16");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_L20 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/l20");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_L24 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/l24");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_L8 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/l8");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_LIBC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/libc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_LPC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/lpc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_M4A =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-m4a");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Matroska =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-matroska");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MED =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/med");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MIDI =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/midi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MIDI_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-midi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MobileXMF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mobile-xmf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MOD =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mod");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MOD_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mod");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mp3");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mp3");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3__ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mpegaudio");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3___ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mpg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3____ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mpg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3_____ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3______ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3_______ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mpeg3");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3________ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mpeg3");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP3Playlist =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mpegurl");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP4 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mp4");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP4A =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-mp4a");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MP4A_LATM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mp4a-latm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MPA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mpa");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MPARobust =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mpa-robust");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_MPEG4Generic =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/mpeg4-generic");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_OggSpeex =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/ogg; codecs=speex");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_OggVorbis =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-ogg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Parityfec =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/paratyfec");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_PCMA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/pcma");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_PCMA_WB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/pcma-wb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_PCMU =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/pcmu");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_PCMU_WB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/pcmu-wb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_QCP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/qcelp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RealAudio =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/application/x-realaudio");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RealAudio_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/application/x-pn-realaudio");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RealAudioPlugin =
    zebcore::utility::ImmutableString::_PrivateCreateStatic(
        "audio/application/x-pn-realaudio-plugin");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RealMedia =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/application/x-pn-realmedia");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RealSID =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/prs.sid");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RED =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/red");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RTP_MIDI =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/rtp-midi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RTPEncAescm128 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/rtp-enc-aescm128");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_RTX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/rtx");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_S3M =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/s3m");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_S3M_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-s3m");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_SMV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/smv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_SMV0 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/smv0");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_SMV_QCP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/smv-qcp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_SP_MIDI =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/sp-midi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Speex =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-speex");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_T140C =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/t140c");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_T38 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/t38");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_TelephoneEvent =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/telephone-event");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Tone =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/tone");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_TrueAudio1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/tta; version=\"1\"");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_TrueAudio2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/tta; version=\"2\"");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ULawAU =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/basic");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_ULPFEC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/ulpfec");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VMR_WB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vmr-wb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Vnd3GPPIUFP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.3gpp.iufp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_Vnd4SB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.4sb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndAudiokoz =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.audiokoz");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndCelp =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.celp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndCiscoNSE =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.cisco.nse");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndCMLESRadioEvents =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.cmles.radio-events");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndCNSANP1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.cns.anp1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndCNSINF1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.cns.inf1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDigitalWinds =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.digital-winds");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDLNA_ADTS =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dlna.adts");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyHEAAC1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.heaac1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyHEAAC2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.heaac2");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyMLP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.mlp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyMPS =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.mps");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyPL2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.pl2");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyPL2X =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.pl2x");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDolbyPL2Z =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dolby.pl2z");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDTS =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dts");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndDTS_HD =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.dts.hd");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndEveradPLJ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.everad.plj");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndHns =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.hns.audio");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndKorvoAurelith =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.korvo.aurelith");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndLucentVoice =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.lucent.voice");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndMsPlayreadyMedia =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.ms-playready.media.pya");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndNokiaMobileXmf =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.nokia.mobile-xmf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndNortelVbk =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.nortel.vbk");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndNueraEcelp4800 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.nuera.ecelp4800");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndNueraEcelp7470 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.nuera.ecelp7470");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndNueraEcelp9600 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.nuera.ecelp9600");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndOctelSbc =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.octel.sbc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndQcelp =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.qcelp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndRhetorex32kADPCM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.rhetorex.32adpcm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndRNRealaudio =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.rn-realaudio");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndRNRealaudio3 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic(
        "audio/vnd.rn-realaudio; version=\"3\"");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndSealedMediaSoftsealMpeg =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.sealedmedia.softseal.mpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_VndVmxCvsd =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.vmx.cvsd");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WAV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/vnd.wave");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WAV_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/wav");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WAV__ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-wav");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WAVE =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/wave");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WAX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-ms-wax");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WEBM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/webm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_WMA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-ms-wma");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_XM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/xm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Audio_XM_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("audio/x-xm");

// Image (33 constants).
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_3DS =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-3ds");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_BMP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/bmp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_BMP_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-bmp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_BMP__ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-ms-bmp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_DjVu =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-djvu");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_DPX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-dpx");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_DWG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-dwg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_DWG_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/vnd.dwg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_DXB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/vnd.dxb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_DXF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/vnd.dxf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_EMF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/emf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_GIF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/gif");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_HEIC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/heic");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_HEIF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/heif");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_JPEG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/jpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_JPEG2k =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/jpeg2000");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_JPEGLS =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/jls");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_JPEGXL =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/jxl");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_JPEGXR =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/jxr");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_JPG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/jpg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_PNG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/png");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_QT =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/mov");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_Splicera =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/vnd.korvo.splicera");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_SVG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/svg-xml");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_SVGXML =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/svg+xml");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_Tessellon =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/vnd.korvo.tessellon");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_TIF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/tif");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_TIFF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/tiff");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_TIFFFX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/tiff-fx");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_VPB =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/vpb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_WebP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/webp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_WMF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/wmf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Image_XBM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("image/x-bitmap");

// Text (56 constants).
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_ActionScript =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-actionscript");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Ada =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-ada");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_AppleScript =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-applescript");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Asm =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-asm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Assembly =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-assembly");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_AWK =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-awk");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Basic =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-basic");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_C =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-c");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_CHeader =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-chdr");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Cobol =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-cobol");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_CPP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-c++src");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_CPPHeader =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-c++hdr");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_CSharp =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-csharp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_CSource =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-csrc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_CSV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/csv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_D =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-d");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Eiffel =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-eiffel");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Forth =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-forth");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Fortran =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-fortan");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Go =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-go");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_HTML =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/html");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Java =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-java");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_JavaProperties =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-java-properties");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_JavaScript =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/javascript");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_JavaSource =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-java-source");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_JSON =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/json");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Log =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-log");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Lua =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-lua");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Matlab =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-matlab");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_ML =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-ml");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Modula =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-modula");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_ObjectiveC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-objectivec");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_ObjectiveCSrc =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-objcsrc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Octave =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-octave");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Pascal =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-pascal");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_PDF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/pdf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Perl =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-perl");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_PHP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-php");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Plain =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/plain");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_PLSQL =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-plsql");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Prolog =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-prolog");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Python =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-python");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_R =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-rsrc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_RTF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/rtf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Ruby =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-ruby");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_SQL =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-sql");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_Swift =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-swift");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_TabSeparated =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/tab-separated-values");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_TCL =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-tcl");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_URL =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/url");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_URL_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-url");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_VBScript =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-vbscript");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_VisualBasic =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-vbasic");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_VisualBasicDotNET =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-vb");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_XML =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/xml");
inline constexpr zebcore::utility::ImmutableString kMimeType_Text_YAML =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("text/x-yaml");

// Video (43 constants).
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_3GPP =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/3gpp");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_3GPP2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/3gpp2");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_3GPPtt =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/3gpp-tt");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_ASF =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-ms-asf");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_ASX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-ms-asx");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_AVI =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/avi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_AVI_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/vnd.avi");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_BMPEG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/bmpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_BT656 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/bt656");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_DV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/dv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_DV_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-dv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_F4V =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/f4v");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_FLC =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/flc");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_FLI =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/fli");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_FLV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/flv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_H261 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/h261");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_H263 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/h263");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_H264 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/h264");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_JPEG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/jpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_JPEG2k =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/jpeg2000");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_M4V =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-m4v");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MP1s =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mp1s");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MP2P =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mp2p");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MP2T =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mp2t");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MP4 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mp4");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MP4VES =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mp4v-es");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPEG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPEG_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-mpeg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPEG2 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mpeg2");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPEG2a =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-mpeg2a");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPEG4Gen =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mpeg4-gen");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPG =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mpg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPG_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-mpg");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MPV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/mpv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_MSVideo =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/msvideo");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_QT =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/quicktime");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_QT_ =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-quicktime");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_Raw =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/raw");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_VC1 =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/vc1");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_WM =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-ms-wm");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_WMA =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-ms-wma");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_WMV =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-ms-wmv");
inline constexpr zebcore::utility::ImmutableString kMimeType_Video_WMX =
    zebcore::utility::ImmutableString::_PrivateCreateStatic("video/x-ms-wmx");

// Every constant above, by top-level type in the order listed; for lookups
// and for checking a text against the whole catalogue.
inline constexpr zebcore::utility::ImmutableString kMimeTypes[] = {
    // Application
    kMimeType_Application_7Zip,
    kMimeType_Application_Ace,
    kMimeType_Application_Arj,
    kMimeType_Application_Arj_,
    kMimeType_Application_B6Z,
    kMimeType_Application_BZip2,
    kMimeType_Application_Cab,
    kMimeType_Application_DGCA,
    kMimeType_Application_GTar,
    kMimeType_Application_GZip,
    kMimeType_Application_GZip_,
    kMimeType_Application_GZip__,
    kMimeType_Application_GZip___,
    kMimeType_Application_GZip____,
    kMimeType_Application_JAR,
    kMimeType_Application_LHA,
    kMimeType_Application_LHARC,
    kMimeType_Application_LZH,
    kMimeType_Application_Lzip,
    kMimeType_Application_LZMA,
    kMimeType_Application_OctetStream,
    kMimeType_Application_RAR,
    kMimeType_Application_TAR,
    kMimeType_Application_TAR_,
    kMimeType_Application_UC2,
    kMimeType_Application_URL,
    kMimeType_Application_URL_,
    kMimeType_Application_XZ,
    kMimeType_Application_ZIP,
    kMimeType_Application_ZIP_,
    kMimeType_Application_ZLIB,
    // Audio
    kMimeType_Audio_32kADPCM,
    kMimeType_Audio_3G2,
    kMimeType_Audio_3GP,
    kMimeType_Audio_8SVX,
    kMimeType_Audio_8SVX_,
    kMimeType_Audio_AAC,
    kMimeType_Audio_AC3,
    kMimeType_Audio_ADBCM,
    kMimeType_Audio_ADPCM,
    kMimeType_Audio_AIFF,
    kMimeType_Audio_AIFF_,
    kMimeType_Audio_AMR,
    kMimeType_Audio_AMRWB,
    kMimeType_Audio_AMRWB_,
    kMimeType_Audio_AMRWBPlus,
    kMimeType_Audio_ASC,
    kMimeType_Audio_ASF,
    kMimeType_Audio_Audible,
    kMimeType_Audio_Audible_,
    kMimeType_Audio_AVI,
    kMimeType_Audio_BV16,
    kMimeType_Audio_BV32,
    kMimeType_Audio_ClearMode,
    kMimeType_Audio_CN,
    kMimeType_Audio_CreativeVoice,
    kMimeType_Audio_Dat12,
    kMimeType_Audio_DECADBCM,
    kMimeType_Audio_DECBASIC,
    kMimeType_Audio_DLS,
    kMimeType_Audio_DVI4,
    kMimeType_Audio_EAC3,
    kMimeType_Audio_EVRC,
    kMimeType_Audio_EVRC0,
    kMimeType_Audio_EVRC1,
    kMimeType_Audio_EVRCB,
    kMimeType_Audio_EVRCB0,
    kMimeType_Audio_EVRCB1,
    kMimeType_Audio_EVRCQCP,
    kMimeType_Audio_EVRCWB,
    kMimeType_Audio_EVRCWB0,
    kMimeType_Audio_EVRCWB1,
    kMimeType_Audio_Example,
    kMimeType_Audio_FLAC,
    kMimeType_Audio_FLAC_,
    kMimeType_Audio_G719,
    kMimeType_Audio_G722,
    kMimeType_Audio_G7221,
    kMimeType_Audio_G723,
    kMimeType_Audio_G726_16,
    kMimeType_Audio_G726_24,
    kMimeType_Audio_G726_32,
    kMimeType_Audio_G726_40,
    kMimeType_Audio_G728,
    kMimeType_Audio_G729,
    kMimeType_Audio_G7291,
    kMimeType_Audio_G729D,
    kMimeType_Audio_G729E,
    kMimeType_Audio_GSM,
    kMimeType_Audio_GSM_EFR,
    kMimeType_Audio_IT,
    kMimeType_Audio_L16,
    kMimeType_Audio_L20,
    kMimeType_Audio_L24,
    kMimeType_Audio_L8,
    kMimeType_Audio_LIBC,
    kMimeType_Audio_LPC,
    kMimeType_Audio_M4A,
    kMimeType_Audio_Matroska,
    kMimeType_Audio_MED,
    kMimeType_Audio_MIDI,
    kMimeType_Audio_MIDI_,
    kMimeType_Audio_MobileXMF,
    kMimeType_Audio_MOD,
    kMimeType_Audio_MOD_,
    kMimeType_Audio_MP3,
    kMimeType_Audio_MP3_,
    kMimeType_Audio_MP3__,
    kMimeType_Audio_MP3___,
    kMimeType_Audio_MP3____,
    kMimeType_Audio_MP3_____,
    kMimeType_Audio_MP3______,
    kMimeType_Audio_MP3_______,
    kMimeType_Audio_MP3________,
    kMimeType_Audio_MP3Playlist,
    kMimeType_Audio_MP4,
    kMimeType_Audio_MP4A,
    kMimeType_Audio_MP4A_LATM,
    kMimeType_Audio_MPA,
    kMimeType_Audio_MPARobust,
    kMimeType_Audio_MPEG4Generic,
    kMimeType_Audio_OggSpeex,
    kMimeType_Audio_OggVorbis,
    kMimeType_Audio_Parityfec,
    kMimeType_Audio_PCMA,
    kMimeType_Audio_PCMA_WB,
    kMimeType_Audio_PCMU,
    kMimeType_Audio_PCMU_WB,
    kMimeType_Audio_QCP,
    kMimeType_Audio_RealAudio,
    kMimeType_Audio_RealAudio_,
    kMimeType_Audio_RealAudioPlugin,
    kMimeType_Audio_RealMedia,
    kMimeType_Audio_RealSID,
    kMimeType_Audio_RED,
    kMimeType_Audio_RTP_MIDI,
    kMimeType_Audio_RTPEncAescm128,
    kMimeType_Audio_RTX,
    kMimeType_Audio_S3M,
    kMimeType_Audio_S3M_,
    kMimeType_Audio_SMV,
    kMimeType_Audio_SMV0,
    kMimeType_Audio_SMV_QCP,
    kMimeType_Audio_SP_MIDI,
    kMimeType_Audio_Speex,
    kMimeType_Audio_T140C,
    kMimeType_Audio_T38,
    kMimeType_Audio_TelephoneEvent,
    kMimeType_Audio_Tone,
    kMimeType_Audio_TrueAudio1,
    kMimeType_Audio_TrueAudio2,
    kMimeType_Audio_ULawAU,
    kMimeType_Audio_ULPFEC,
    kMimeType_Audio_VMR_WB,
    kMimeType_Audio_Vnd3GPPIUFP,
    kMimeType_Audio_Vnd4SB,
    kMimeType_Audio_VndAudiokoz,
    kMimeType_Audio_VndCelp,
    kMimeType_Audio_VndCiscoNSE,
    kMimeType_Audio_VndCMLESRadioEvents,
    kMimeType_Audio_VndCNSANP1,
    kMimeType_Audio_VndCNSINF1,
    kMimeType_Audio_VndDigitalWinds,
    kMimeType_Audio_VndDLNA_ADTS,
    kMimeType_Audio_VndDolbyHEAAC1,
    kMimeType_Audio_VndDolbyHEAAC2,
    kMimeType_Audio_VndDolbyMLP,
    kMimeType_Audio_VndDolbyMPS,
    kMimeType_Audio_VndDolbyPL2,
    kMimeType_Audio_VndDolbyPL2X,
    kMimeType_Audio_VndDolbyPL2Z,
    kMimeType_Audio_VndDTS,
    kMimeType_Audio_VndDTS_HD,
    kMimeType_Audio_VndEveradPLJ,
    kMimeType_Audio_VndHns,
    kMimeType_Audio_VndKorvoAurelith,
    kMimeType_Audio_VndLucentVoice,
    kMimeType_Audio_VndMsPlayreadyMedia,
    kMimeType_Audio_VndNokiaMobileXmf,
    kMimeType_Audio_VndNortelVbk,
    kMimeType_Audio_VndNueraEcelp4800,
    kMimeType_Audio_VndNueraEcelp7470,
    kMimeType_Audio_VndNueraEcelp9600,
    kMimeType_Audio_VndOctelSbc,
    kMimeType_Audio_VndQcelp,
    kMimeType_Audio_VndRhetorex32kADPCM,
    kMimeType_Audio_VndRNRealaudio,
    kMimeType_Audio_VndRNRealaudio3,
    kMimeType_Audio_VndSealedMediaSoftsealMpeg,
    kMimeType_Audio_VndVmxCvsd,
    kMimeType_Audio_WAV,
    kMimeType_Audio_WAV_,
    kMimeType_Audio_WAV__,
    kMimeType_Audio_WAVE,
    kMimeType_Audio_WAX,
    kMimeType_Audio_WEBM,
    kMimeType_Audio_WMA,
    kMimeType_Audio_XM,
    kMimeType_Audio_XM_,
    // Image
    kMimeType_Image_3DS,
    kMimeType_Image_BMP,
    kMimeType_Image_BMP_,
    kMimeType_Image_BMP__,
    kMimeType_Image_DjVu,
    kMimeType_Image_DPX,
    kMimeType_Image_DWG,
    kMimeType_Image_DWG_,
    kMimeType_Image_DXB,
    kMimeType_Image_DXF,
    kMimeType_Image_EMF,
    kMimeType_Image_GIF,
    kMimeType_Image_HEIC,
    kMimeType_Image_HEIF,
    kMimeType_Image_JPEG,
    kMimeType_Image_JPEG2k,
    kMimeType_Image_JPEGLS,
    kMimeType_Image_JPEGXL,
    kMimeType_Image_JPEGXR,
    kMimeType_Image_JPG,
    kMimeType_Image_PNG,
    kMimeType_Image_QT,
    kMimeType_Image_Splicera,
    kMimeType_Image_SVG,
    kMimeType_Image_SVGXML,
    kMimeType_Image_Tessellon,
    kMimeType_Image_TIF,
    kMimeType_Image_TIFF,
    kMimeType_Image_TIFFFX,
    kMimeType_Image_VPB,
    kMimeType_Image_WebP,
    kMimeType_Image_WMF,
    kMimeType_Image_XBM,
    // Text
    kMimeType_Text_ActionScript,
    kMimeType_Text_Ada,
    kMimeType_Text_AppleScript,
    kMimeType_Text_Asm,
    kMimeType_Text_Assembly,
    kMimeType_Text_AWK,
    kMimeType_Text_Basic,
    kMimeType_Text_C,
    kMimeType_Text_CHeader,
    kMimeType_Text_Cobol,
    kMimeType_Text_CPP,
    kMimeType_Text_CPPHeader,
    kMimeType_Text_CSharp,
    kMimeType_Text_CSource,
    kMimeType_Text_CSV,
    kMimeType_Text_D,
    kMimeType_Text_Eiffel,
    kMimeType_Text_Forth,
    kMimeType_Text_Fortran,
    kMimeType_Text_Go,
    kMimeType_Text_HTML,
    kMimeType_Text_Java,
    kMimeType_Text_JavaProperties,
    kMimeType_Text_JavaScript,
    kMimeType_Text_JavaSource,
    kMimeType_Text_JSON,
    kMimeType_Text_Log,
    kMimeType_Text_Lua,
    kMimeType_Text_Matlab,
    kMimeType_Text_ML,
    kMimeType_Text_Modula,
    kMimeType_Text_ObjectiveC,
    kMimeType_Text_ObjectiveCSrc,
    kMimeType_Text_Octave,
    kMimeType_Text_Pascal,
    kMimeType_Text_PDF,
    kMimeType_Text_Perl,
    kMimeType_Text_PHP,
    kMimeType_Text_Plain,
    kMimeType_Text_PLSQL,
    kMimeType_Text_Prolog,
    kMimeType_Text_Python,
    kMimeType_Text_R,
    kMimeType_Text_RTF,
    kMimeType_Text_Ruby,
    kMimeType_Text_SQL,
    kMimeType_Text_Swift,
    kMimeType_Text_TabSeparated,
    kMimeType_Text_TCL,
    kMimeType_Text_URL,
    kMimeType_Text_URL_,
    kMimeType_Text_VBScript,
    kMimeType_Text_VisualBasic,
    kMimeType_Text_VisualBasicDotNET,
    kMimeType_Text_XML,
    kMimeType_Text_YAML,
    // Video
    kMimeType_Video_3GPP,
    kMimeType_Video_3GPP2,
    kMimeType_Video_3GPPtt,
    kMimeType_Video_ASF,
    kMimeType_Video_ASX,
    kMimeType_Video_AVI,
    kMimeType_Video_AVI_,
    kMimeType_Video_BMPEG,
    kMimeType_Video_BT656,
    kMimeType_Video_DV,
    kMimeType_Video_DV_,
    kMimeType_Video_F4V,
    kMimeType_Video_FLC,
    kMimeType_Video_FLI,
    kMimeType_Video_FLV,
    kMimeType_Video_H261,
    kMimeType_Video_H263,
    kMimeType_Video_H264,
    kMimeType_Video_JPEG,
    kMimeType_Video_JPEG2k,
    kMimeType_Video_M4V,
    kMimeType_Video_MP1s,
    kMimeType_Video_MP2P,
    kMimeType_Video_MP2T,
    kMimeType_Video_MP4,
    kMimeType_Video_MP4VES,
    kMimeType_Video_MPEG,
    kMimeType_Video_MPEG_,
    kMimeType_Video_MPEG2,
    kMimeType_Video_MPEG2a,
    kMimeType_Video_MPEG4Gen,
    kMimeType_Video_MPG,
    kMimeType_Video_MPG_,
    kMimeType_Video_MPV,
    kMimeType_Video_MSVideo,
    kMimeType_Video_QT,
    kMimeType_Video_QT_,
    kMimeType_Video_Raw,
    kMimeType_Video_VC1,
    kMimeType_Video_WM,
    kMimeType_Video_WMA,
    kMimeType_Video_WMV,
    kMimeType_Video_WMX,
};

inline constexpr std::size_t kMimeTypeCount = 331;
static_assert(sizeof(kMimeTypes) / sizeof(kMimeTypes[0]) == kMimeTypeCount);

}  // namespace zebmediatypes
